#pragma once

#include "Utility/CARGBPlane.h"

#include <array>
#include <cstdint>
#include <vector>

namespace orvela {

/// The pixel operation that both illumination iterations share: each sample is multiplied by a sigmoid gain
/// that compares it with a weighted surround of the pixel itself and its left, upper and upper-left
/// neighbours.
///
///     gain = 1 + tanh(I * k / (S + 1) - 2),   k = W * 255 / epsilon,   out = floor(gain * I / 1.44)
///
/// I is the sample, S the truncated weighted sum of the window, W the sum of its weights. Results above 255
/// are clamped. The divisor keeps flat areas at their brightness over both iterations at the middle position:
/// the square root of the product of their flat gains there, 1.2325 * 1.6823.
class IlluminationKernel {
public:
    /// Prepares the weights, and for pictures where it pays, a table of all interior results.
    /// @param epsilon     surround normaliser, above 0
    /// @param pixelCount  pixels of the picture
    IlluminationKernel(float epsilon, std::int32_t pixelCount);

    /// Computes row y of `out` from `in`.
    void applyRow(const CARGBPlane& in, CARGBPlane& out, int y) const;

    /// The plain form of applyRow: no table. Same results.
    void applyRowPlain(const CARGBPlane& in, CARGBPlane& out, int y) const;

    /// The result for one sample.
    /// @param sum   truncated weighted sum of the window, 0 to 967
    /// @param k  k of the formula
    static std::uint8_t result(std::uint8_t sample, int sum, float k);

private:
    void applyPixel(const CARGBPlane& in, CARGBPlane& out, int x, int y) const;
    void buildTable();
    float factor(float weightSum) const;

    std::array<float, 3> mWeights; ///< by squared distance from the pixel
    float mEpsilon;
    float mInteriorFactor;            ///< k where the window is whole
    std::vector<std::uint8_t> mTable; ///< interior results by sample and sum; empty when computed directly
};

} // namespace orvela
