#pragma once

#include "GUI/Controls/ZoneStop.h"
#include "Settings/SliderTable.h"

namespace orvela {

/// The track colours that tell mild from strong and extreme positions.
namespace TrackZones {

/// The stops of a set, in rising order of position.
QList<ZoneStop> set(ZoneSet zones);

} // namespace TrackZones

} // namespace orvela
