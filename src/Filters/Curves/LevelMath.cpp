#include "Filters/Curves/LevelMath.h"

#include "Filters/Curves/GammaCurve.h"
#include "Settings/SliderScale.h"

#include <cmath>

namespace orvela {

namespace LevelMath {

float bell(double luma, float mean, const Bell& shape) {
    const double sech = 1 / std::cosh((mean - luma) / shape.width);
    return static_cast<float>((sech - shape.shift) / shape.scale);
}

float topRangeWeight(float position) {
    return position > 900 ? static_cast<float>((static_cast<double>(position) - 900) / 200 + 1) : 1.0F;
}

float absoluteLevel(float position) {
    return static_cast<float>(static_cast<double>(position) * 255 / 1000);
}

float perceptualLevel(float coefficient, float position, double share) {
    return static_cast<float>(static_cast<double>(coefficient) * position / 1000 * share);
}

Levels replacing(const Levels& levels) {
    Levels result;
    for (std::size_t c = 0; c < 3; ++c)
        result.own[c] = levels.own[c] != 0 ? levels.own[c] : levels.common;
    return result;
}

MoveTables::MoveTables(const Levels& levels, const std::function<float(double luma)>& weight, Move move) {
    std::array<float, SumValueTable::kSums> weights;
    for (std::size_t sum = 0; sum < weights.size(); ++sum)
        weights[sum] = weight(static_cast<double>(sum) / 3);
    for (std::size_t c = 0; c < 3; ++c) {
        const float own = levels.own[c];
        const auto model = std::find(levels.own.begin(), levels.own.end(), own) - levels.own.begin();
        mOfChannel[c] = static_cast<std::size_t>(model);
        if (mOfChannel[c] < c)
            continue;
        mTables[c].build([&, own](int sum) {
            return [&, own, k = weights[static_cast<std::size_t>(sum)]](int x) {
                return move(move(static_cast<float>(x), k, levels.common), k, own);
            };
        });
    }
}

void MoveTables::apply(const PixelRow& row) const {
    SumValueTable::map({&mTables[mOfChannel[0]], &mTables[mOfChannel[1]], &mTables[mOfChannel[2]]}, row);
}

float sliderToGamma(float position) {
    return static_cast<float>(SliderScales::gammaAt(position));
}

float gammaRatio(float mean, float gamma) {
    if (mean <= 0 || gamma == 1)
        return 1;
    return GammaCurve::transfer(PixelMath::trunc(mean), gamma) / mean;
}

WideTables factorMaps(float common, const std::array<float, 3>& own) {
    const auto map = [common](float factor) {
        return makeTable<WideTable>([common, factor](int x) {
            const int scaled = PixelMath::trunc(static_cast<float>(x) * common);
            return PixelMath::trunc(static_cast<float>(scaled) * factor);
        });
    };
    return {map(own[0]), map(own[1]), map(own[2])};
}

WideTables gammaMaps(float gamma) {
    const auto map =
        makeTable<WideTable>([gamma](int x) { return gamma > 0 ? GammaCurve::apply(x, gamma) : x; });
    return {map, map, map};
}

} // namespace LevelMath

} // namespace orvela
