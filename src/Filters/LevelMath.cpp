#include "Filters/LevelMath.h"

#include "Filters/PixelMath.h"

#include <cmath>

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

namespace {

constexpr std::size_t kSums = 3 * 255 + 1;
constexpr std::size_t kTableSize = kSums * 256;

// Only the values that can occur in a pixel of the sum are filled in.
void fillTable(std::uint8_t* table, const std::array<float, kSums>& weights, float common, float own,
               MoveTables::Move move) {
    for (std::size_t sum = 0; sum < kSums; ++sum) {
        const std::size_t first = sum > 510 ? sum - 510 : 0;
        const std::size_t last = std::min<std::size_t>(sum, 255);
        for (std::size_t x = first; x <= last; ++x) {
            const float moved = move(static_cast<float>(x), weights[sum], common);
            table[sum * 256 + x] = static_cast<std::uint8_t>(move(moved, weights[sum], own));
        }
    }
}

} // namespace

MoveTables::MoveTables(const Levels& levels, const std::function<float(double luma)>& weight, Move move) {
    std::array<float, kSums> weights;
    for (std::size_t sum = 0; sum < kSums; ++sum)
        weights[sum] = weight(static_cast<double>(sum) / 3);
    for (std::size_t c = 0; c < 3; ++c) {
        const auto same = std::find(levels.own.begin(), levels.own.end(), levels.own[c]);
        const auto model = static_cast<std::size_t>(same - levels.own.begin());
        mOfChannel[c] = model < c ? mOfChannel[model] : mTables.size();
        if (model < c)
            continue;
        mTables.resize(mTables.size() + kTableSize);
        fillTable(mTables.data() + mOfChannel[c], weights, levels.common, levels.own[c], move);
    }
}

void MoveTables::applyRow(const ConstRow& in, const Row& out, int width) const {
    const std::uint8_t* const red = mTables.data() + mOfChannel[0];
    const std::uint8_t* const green = mTables.data() + mOfChannel[1];
    const std::uint8_t* const blue = mTables.data() + mOfChannel[2];
    for (int x = 0; x < width; ++x) {
        const auto line = static_cast<std::size_t>(in[0][x] + in[1][x] + in[2][x]) * 256;
        out[0][x] = red[line + in[0][x]];
        out[1][x] = green[line + in[1][x]];
        out[2][x] = blue[line + in[2][x]];
    }
}

float sliderToGamma(float position) {
    const double v = position;
    return static_cast<float>(v >= 500 ? (v - 500) * 9 / 500 + 1 : v * 0.9 / 500 + 0.1);
}

float gammaTransfer(int level, float gamma) {
    if (level < 1 || gamma <= 0)
        return 0;
    return static_cast<float>(std::pow(level / 255.0, 1.0 / gamma)) * 255.0F;
}

float gammaRatio(float mean, float gamma) {
    if (mean <= 0 || gamma == 1)
        return 1;
    return gammaTransfer(PixelMath::trunc(mean), gamma) / mean;
}

ChannelMaps factorMaps(float common, const std::array<float, 3>& own) {
    ChannelMaps maps;
    for (std::size_t c = 0; c < 3; ++c) {
        for (std::size_t x = 0; x < 256; ++x) {
            const int scaled = PixelMath::trunc(static_cast<float>(x) * common);
            maps[c][x] = PixelMath::trunc(static_cast<float>(scaled) * own[c]);
        }
    }
    return maps;
}

ChannelMaps gammaMaps(float gamma) {
    ChannelMaps maps;
    for (int x = 0; x < 256; ++x)
        maps[0][static_cast<std::size_t>(x)] = gamma > 0 ? PixelMath::trunc(gammaTransfer(x, gamma)) : x;
    maps[1] = maps[2] = maps[0];
    return maps;
}

void mapRow(const ConstRow& in, const Row& out, int width, const ChannelMaps& maps) {
    for (int x = 0; x < width; ++x) {
        const PixelMath::Rgb mapped =
            PixelMath::keepHue({maps[0][in[0][x]], maps[1][in[1][x]], maps[2][in[2][x]]});
        out[0][x] = static_cast<std::uint8_t>(mapped.r);
        out[1][x] = static_cast<std::uint8_t>(mapped.g);
        out[2][x] = static_cast<std::uint8_t>(mapped.b);
    }
}

} // namespace LevelMath
