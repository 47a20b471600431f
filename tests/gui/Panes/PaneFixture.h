#pragma once

#include "GUI/Panes/IWgtPane.h"

#include <QVBoxLayout>

namespace orvela {

/// A pane of type P shown in its window.
template <class P>
struct Shown {
    explicit Shown(EGUIMode mode) : pane(new P(&owner, mode)) {
        (new QVBoxLayout(&owner))->addWidget(pane);
        owner.show();
    }

    QWidget owner;
    P* pane;
};

} // namespace orvela
