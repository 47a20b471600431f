#pragma once

#include "Settings/CUserParams.h"
#include "Utility/CARGBPlane.h"

#include <array>

namespace orvela {

/// The method that all analyzers share: bend a histogram as if a tone curve had been applied to the picture,
/// then weigh its bins with a smooth step.
namespace ToneMass {

/// Where a tone curve moves each bin; values below 0 or from 256 on lie outside the histogram.
using Curve = std::array<float, 256>;

/// Tabulates a curve given as a function of the bin index (int to double).
template <typename Function>
Curve tabulate(Function curve) {
    Curve table;
    for (int i = 0; i < 256; ++i)
        table[static_cast<std::size_t>(i)] = static_cast<float>(curve(i));
    return table;
}

/// The bin that bin `i` moves to, truncated toward zero; may lie outside 0 to 255.
inline int target(const Curve& curve, std::size_t i) {
    return static_cast<int>(curve[i]);
}

/// The histogram with its bins moved along the curve; bins that leave 0 to 255 are dropped.
Histogram remap(const Histogram& bins, const Curve& curve);

/// Smooth step from 0 well below `center` to 1 well above it: (tanh((i - center) / slope) + 1) / 2.
float risingStep(int i, double center, double slope);

/// Sum of the bins, each weighed with the rising step.
double risingMass(const Histogram& bins, double center, double slope);

/// Sum of the bins, each weighed with 1 minus the rising step.
double fallingMass(const Histogram& bins, double center, double slope);

/// The coefficient scale / (mass / pixels) * gain; 0 without mass.
double inverseShare(double scale, double mass, int pixels, double gain);

/// The smallest left limit of the red, green and blue histograms: the first of three filled bins in a row,
/// 0 for a channel without one. Found limits are logged.
int leftLimit(const CUserParams& params);

/// The largest right limit of the red, green and blue histograms: the last of two filled bins in a row, 255
/// for a channel without one. Found limits are logged.
int rightLimit(const CUserParams& params);

/// Counts the plane anew into the four histograms of `params`: every fifth row of each piece of rows, every
/// column.
void recount(const CARGBPlane& plane, CUserParams& params);

} // namespace ToneMass

} // namespace orvela
