#pragma once

#include "GUI/Panes/IWgtPane.h"

#include <QColor>
#include <QVBoxLayout>

namespace orvela {

/// Stands in for the window of a pane and records what it is told.
class RecordingOwner : public QWidget {
    Q_OBJECT

public:
    QList<double> values;
    QList<bool> states;
    QList<QColor> colors;

public Q_SLOTS:
    void onMy_slider_valueChanged(double value) { values.append(value); }
    void onMy_slider_stateChanged(bool on) { states.append(on); }
    void onMy_colorPicker_colorChanged(QColor color) { colors.append(color); }
};

/// A pane of type P shown in its window.
template <class P>
struct Shown {
    explicit Shown(EGUIMode mode) : pane(new P(&owner, mode)) {
        (new QVBoxLayout(&owner))->addWidget(pane);
        owner.show();
    }

    RecordingOwner owner;
    P* pane;
};

} // namespace orvela
