#pragma once

#include <QColor>
#include <QList>

namespace orvela {

/// A colour at a place of a slider's track. A band of one colour is two stops, at its first and last
/// position.
struct ZoneStop {
    double position; ///< 0 to 1000
    QColor color;

    friend bool operator==(const ZoneStop&, const ZoneStop&) = default;
};

/// The colour at `position`: mixed from the two stops around it by its place between them; before the first
/// and after the last stop their own colours. `stops` are in rising order, at least one.
QColor zoneColor(const QList<ZoneStop>& stops, double position);

} // namespace orvela
