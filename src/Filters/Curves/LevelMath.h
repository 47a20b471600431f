#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/Kernels/SumValueTable.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <functional>

namespace orvela {

/// What the filters of the shadow, midtone and highlight levels share.
namespace LevelMath {

/// Shape of a weight over the luma: 1 / cosh(distance from the mean / width), shifted and rescaled to run
/// from about 0 far away to about 1 at the mean.
struct Bell {
    double width; ///< in grey levels
    double shift;
    double scale;
};

inline constexpr Bell kNarrowBell = {30, 0.028, 0.97}; ///< absolute shadows
inline constexpr Bell kPerceptualBell = {70, 0.32, 0.6782};
inline constexpr Bell kWideBell = {120, 0.32, 0.6782}; ///< absolute and touched highlights

/// (sech((mean - luma) / width) - shift) / scale; slightly negative far from the mean.
float bell(double luma, float mean, const Bell& shape);

/// Weight of a perceptual slider's top range: 1 up to position 900, then rising to 1.5 at 1000.
float topRangeWeight(float position);

/// Lowers a value (0 to 255), dark ones most: x - weight * level * (1 - x / 255). A weight may be negative,
/// so both ends are clamped.
inline float darken(float x, float weight, float level) {
    const double value = x - static_cast<double>(weight) * level * (1 - static_cast<double>(x) / 255);
    return static_cast<float>(std::clamp(value, 0.0, 255.0));
}

/// Raises a value (0 to 255), light ones most: x + weight * level * x / 255, clamped at both ends.
inline float brighten(float x, float weight, float level) {
    const double value = x + static_cast<double>(weight) * level * static_cast<double>(x) / 255;
    return static_cast<float>(std::clamp(value, 0.0, 255.0));
}

/// Strengths in grey levels: `common` moves every channel first, `own` then moves each channel again. 0 moves
/// nothing.
struct Levels {
    float common = 0;
    std::array<float, 3> own = {};
};

/// The level of an absolute slider at a position: 0 to 255.
float absoluteLevel(float position);

/// The level of a perceptual slider: coefficient * position / 1000 * share.
float perceptualLevel(float coefficient, float position, double share = 1);

/// Levels of which a channel's own one, where it is not 0, takes the place of the common one.
Levels replacing(const Levels& levels);

/// What a shadow or highlight filter makes of every pixel: the new value of a channel depends only on its old
/// value and on the pixel's luma, so it is tabulated by value and by the sum R + G + B.
class MoveTables {
public:
    using Move = float (*)(float x, float weight, float level);

    /// @param weight  of a luma, (R + G + B) / 3
    /// @param move    darken or brighten
    MoveTables(const Levels& levels, const std::function<float(double luma)>& weight, Move move);

    void apply(const PixelRow& row) const;

private:
    std::array<SumValueTable, 3> mTables;       ///< built for each different level
    std::array<std::size_t, 3> mOfChannel = {}; ///< each channel's table
};

/// The gamma of a slider (see SliderScales::gammaAt), as a float.
float sliderToGamma(float position);

/// How much a gamma brightens the mean: the transfer of its whole part divided by it. Exactly 1 for gamma 1
/// and for a mean that is not positive.
float gammaRatio(float mean, float gamma);

/// Multiplication by a common factor, then by the channel's own one, truncated after each.
WideTables factorMaps(float common, const std::array<float, 3>& own);

/// The gamma transfer of every value; the identity when gamma is not positive.
WideTables gammaMaps(float gamma);

} // namespace LevelMath

} // namespace orvela
