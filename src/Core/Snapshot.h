#pragma once

#include "Utility/CARGBPlane.h"

#include <QRect>

#include <memory>

namespace orvela {

/// A copy of a part of a picture, reduced for a view: each of its pixels is the mean of `reduction` by
/// `reduction` pixels (fewer at the right and lower edge), rounded to nearest.
/// @param area       in pixels of the picture; what lies outside of it is cut off
/// @param reduction  1 for a plain copy
/// @throws CGenericEx when the memory cannot be had
std::unique_ptr<CARGBPlane> takeSnapshot(const CARGBPlane& picture, const QRect& area, int reduction);

} // namespace orvela
