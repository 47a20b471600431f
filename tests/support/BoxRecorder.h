#pragma once

#include "Utility/DebugBoxes.h"

#include <QStringList>

namespace orvela {

/// "title|text" of every box shown while `action` runs.
template <typename Action>
QStringList boxes(const Action& action) {
    static QStringList shown;
    shown.clear();
    DebugBoxes::setPresenter([](void*, const QString& title, const QString& text, int, int) {
        shown.append(title + QLatin1Char('|') + text);
        return int(DebugBoxes::Ok);
    });
    action();
    DebugBoxes::setPresenter(nullptr);
    return shown;
}

} // namespace orvela
