#pragma once

#include "Filters/Kernels/PixelMath.h"
#include "Filters/Kernels/PixelRow.h"

#include <vector>

namespace orvela {

/// Changes the saturation of pixels in HSV space, hue and largest channel staying as they are:
///
///     lowering   Sat' = Sat - Sat * alfa
///     raising    Sat' = Sat + alfa / cosh((255 - 255 Sat) / 120) / (2 - Sat)^2, at most 1
///
/// in single precision but for cosh.
class SaturationKernel {
public:
    enum class Change { Lower, Raise };

    /// @param alfa  saturation factor, 0 to 1.2
    SaturationKernel(Change change, float alfa);

    /// Maps a row.
    void applyRow(const PixelRow& row) const;

    /// The plain form of applyRow, pixel by pixel. Same results.
    void applyRowPlain(const PixelRow& row) const;

private:
    PixelMath::Rgb resaturate(int r, int g, int b) const;

    std::vector<float>
        mSaturations; ///< new saturations by the largest channel * 256 + the range of the channels
};

} // namespace orvela
