#pragma once

#include "GUI/Controls/ZoneStop.h"

namespace orvela {

/// The numbered sets of track colours that tell mild from strong and extreme positions.
namespace TrackZones {

/// The stops of set `number`: 1 to 12, or 13, which is set 5 with a paler orange. Empty for any other number.
QList<ZoneStop> set(int number);

} // namespace TrackZones

} // namespace orvela
