#pragma once

#include "Utility/CARGBPlane.h"

#include <array>

namespace orvela {

/// The pixel operation of the edge-aware smoothing: where the colour variation D in the 5x5 window is small
/// compared with the window's brightness M, the pixel becomes a Gaussian-weighted average.
///
///     D / (M / 3) < threshold,   weight = exp(-d^2 / 6.25) / 0.72,   out = trunc(sum / 20)
///
/// D adds the distances of the window's colours to the centre's in single precision, row by row; M is the
/// plain sum of the window's 75 samples. An undefined ratio (a black window) is not below the threshold.
class SmoothingKernel {
public:
    static constexpr int kRadius = 2;
    static constexpr float Gauss_denominator = 3.0F; ///< divides the brightness of the window

    explicit SmoothingKernel(double threshold);

    /// Smooths the columns first to last - 1 of row y; the window must lie inside the picture.
    void applyRow(const CARGBPlane& in, CARGBPlane& out, int y, int first, int last) const;

    /// The plain form of applyRow, pixel by pixel. Same results.
    void applyRowPlain(const CARGBPlane& in, CARGBPlane& out, int y, int first, int last) const;

private:
    bool isSmooth(const CARGBPlane& in, int x, int y) const;

    std::array<float, 10> mGauss = {}; ///< weights by squared distance, entries 0 to 8
    float mThreshold; ///< the smallest float not below the threshold: the comparison is the same
};

} // namespace orvela
