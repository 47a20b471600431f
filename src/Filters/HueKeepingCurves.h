#pragma once

#include "Filters/PixelMath.h"
#include "Utility/CARGBPlane.h"

#include <array>

/// One result per sample value, before the hue-keeping rescale; at least 0, may exceed 255.
using Curve = std::array<int, 256>;

/// Maps a row of `width` pixels through the curves of its channels and rescales pixels that leave the range
/// (PixelMath::keepHue). The rows may be the same.
inline void applyCurves(const Curve& red, const Curve& green, const Curve& blue, const ConstRow& in,
                        const Row& out, int width) {
    for (int x = 0; x < width; ++x) {
        const PixelMath::Rgb c = PixelMath::keepHue({red[in[0][x]], green[in[1][x]], blue[in[2][x]]});
        out[0][x] = static_cast<std::uint8_t>(c.r);
        out[1][x] = static_cast<std::uint8_t>(c.g);
        out[2][x] = static_cast<std::uint8_t>(c.b);
    }
}
