#pragma once

#include <QKeySequence>
#include <QList>
#include <QString>

namespace orvela {

/// A tool tip that tells the keys of what it belongs to, if there are any: the first of them.
QString withKeys(const QString& toolTip, const QList<QKeySequence>& keys);

/// Keys as the user's keyboard names them.
QString nameOf(const QKeySequence& keys);

} // namespace orvela
