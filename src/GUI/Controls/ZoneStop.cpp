#include "GUI/Controls/ZoneStop.h"

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

int mixed(int from, int to, double share) {
    return static_cast<int>(std::lround(from + (to - from) * share));
}

} // namespace

QColor zoneColor(const QList<ZoneStop>& stops, double position) {
    const auto next = std::find_if(stops.begin(), stops.end(),
                                   [position](const ZoneStop& stop) { return stop.position >= position; });
    if (next == stops.end())
        return stops.last().color;
    if (next == stops.begin())
        return next->color;
    const ZoneStop& before = *(next - 1);
    const double share = (position - before.position) / (next->position - before.position);
    return QColor(mixed(before.color.red(), next->color.red(), share),
                  mixed(before.color.green(), next->color.green(), share),
                  mixed(before.color.blue(), next->color.blue(), share));
}

} // namespace orvela
