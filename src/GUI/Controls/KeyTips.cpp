#include "GUI/Controls/KeyTips.h"

#include <QCoreApplication>

namespace orvela {

QString withKeys(const QString& toolTip, const QList<QKeySequence>& keys) {
    if (keys.isEmpty())
        return toolTip;
    return QCoreApplication::translate("KeyTips", "%1 (%2)", "tool tip and keys")
        .arg(toolTip, nameOf(keys.first()));
}

QString nameOf(const QKeySequence& keys) {
    return keys.toString(QKeySequence::NativeText);
}

} // namespace orvela
