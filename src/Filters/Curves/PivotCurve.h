#pragma once

#include <algorithm>

namespace orvela {

/// The contrast curve about a pivot level, in single precision.
namespace PivotCurve {

/// A channel value (0 to 255) with a brightness added, limited to 0 to 255.
inline float clampAdd(int c, float brightness) {
    return std::clamp(static_cast<float>(c) + brightness, 0.0F, 255.0F);
}

/// Moves a value away from the pivot by (distance) * k / (101 - k), or toward it when k is negative; 0 is
/// the identity. The result is limited to 0 to 255.
/// @param value  0 to 255
/// @param pivot  0 to 255, a whole number
/// @param k      above -100, below 101
inline float apply(float value, float pivot, float k) {
    if (value >= pivot + 1)
        return std::min((value - pivot) * k / (101 - k) + value, 255.0F);
    return std::max(value - (pivot - value) * k / (101 - k), 0.0F);
}

} // namespace PivotCurve

} // namespace orvela
