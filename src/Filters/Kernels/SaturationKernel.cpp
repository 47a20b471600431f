#include "Filters/Kernels/SaturationKernel.h"

#include "Filters/Kernels/RowMapping.h"
#include "Filters/Kernels/Simd.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace orvela {

namespace {

constexpr int kTileWidth = 256;

float changed(SaturationKernel::Change change, float alfa, float saturation) {
    if (change == SaturationKernel::Change::Lower)
        return saturation - saturation * alfa;
    const double boost = alfa / std::cosh(static_cast<double>((255 - 255 * saturation) / 120));
    const float headroom = 2 - saturation;
    return static_cast<float>(std::min(saturation + boost / (headroom * headroom), 1.0));
}

// Values 0 to 1 of the channels of a colour of hue (degrees), saturation and value.
std::array<float, 3> fromHsv(float hue, float saturation, float v) {
    if (saturation == 0)
        return {v, v, v};
    const float h = hue / 60;
    const float i = std::floor(h);
    const float f = h - i;
    const float p = v * (1 - saturation);
    const float q = v * (1 - f * saturation);
    const float t = v * (1 - (1 - f) * saturation);
    switch (static_cast<int>(i)) {
    case 1:
        return {q, v, p};
    case 2:
        return {p, v, t};
    case 3:
        return {p, q, v};
    case 4:
        return {t, p, v};
    case 5:
        return {v, p, q};
    default:
        return {v, t, p};
    }
}

float hueOf(int r, int g, int b, int largest, int range) {
    if (range == 0)
        return 0;
    const auto share = [range](int difference) {
        return static_cast<float>(difference) * 60 / static_cast<float>(range);
    };
    if (r == largest)
        return g < b ? share(g - b) + 360 : share(g - b);
    if (g == largest)
        return share(b - r) + 120;
    return share(r - g) + 240;
}

// A run of pixels, one property after the other, so that the arithmetic runs on vectors.
struct Tile {
    int channel[3][kTileWidth];
    int place[kTileWidth]; // in the table of saturations
    float saturation[kTileWidth];
};

ORVELA_SIMD void loadTile(const ConstRow& in, int first, int count, Tile& tile) {
    for (std::size_t c = 0; c < 3; ++c) {
        const std::uint8_t* from = in[c] + first;
        for (int i = 0; i < count; ++i)
            tile.channel[c][i] = from[i];
    }
    for (int i = 0; i < count; ++i) {
        const int r = tile.channel[0][i];
        const int g = tile.channel[1][i];
        const int b = tile.channel[2][i];
        const int largest = std::max(std::max(r, g), b);
        tile.place[i] = largest * 256 + largest - std::min(std::min(r, g), b);
    }
}

// The arithmetic of hueOf and fromHsv with selections in place of branches. The hue is never negative, so its
// sector is the truncated sixth; a range of 0 comes with a difference of 0.
ORVELA_SIMD void convertTile(Tile& tile, int count) {
    for (int i = 0; i < count; ++i) {
        const int r = tile.channel[0][i];
        const int g = tile.channel[1][i];
        const int b = tile.channel[2][i];
        const int largest = tile.place[i] >> 8;
        const int range = tile.place[i] & 255;
        const int difference = r == largest ? g - b : (g == largest ? b - r : r - g);
        const int offset = r == largest ? (g < b ? 360 : 0) : (g == largest ? 120 : 240);
        const float share = static_cast<float>(difference) * 60 / static_cast<float>(std::max(range, 1));
        const float h = (share + static_cast<float>(offset)) / 60;
        const int sector = static_cast<int>(h);
        const float f = h - static_cast<float>(sector);
        const float saturation = tile.saturation[i];
        const float v = static_cast<float>(largest) / 255;
        const int top = static_cast<int>(255 * v);
        const int p = static_cast<int>(255 * (v * (1 - saturation)));
        const int q = static_cast<int>(255 * (v * (1 - f * saturation)));
        const int t = static_cast<int>(255 * (v * (1 - (1 - f) * saturation)));
        // The middle channel falls in the odd sectors and rises in the even ones.
        const int middle = (sector & 1) != 0 ? q : t;
        tile.channel[0][i] = sector == 0 || sector == 5 ? top : (sector == 1 || sector == 4 ? middle : p);
        tile.channel[1][i] = sector == 1 || sector == 2 ? top : (sector == 0 || sector == 3 ? middle : p);
        tile.channel[2][i] = sector == 3 || sector == 4 ? top : (sector == 2 || sector == 5 ? middle : p);
    }
}

ORVELA_SIMD void storeTile(const Tile& tile, const Row& out, int first, int count) {
    for (std::size_t c = 0; c < 3; ++c) {
        std::uint8_t* to = out[c] + first;
        for (int i = 0; i < count; ++i)
            to[i] = static_cast<std::uint8_t>(tile.channel[c][i]);
    }
}

} // namespace

SaturationKernel::SaturationKernel(Change change, float alfa) : mSaturations(256 * 256) {
    for (std::size_t largest = 1; largest < 256; ++largest) {
        for (std::size_t range = 0; range <= largest; ++range)
            mSaturations[largest * 256 + range] =
                changed(change, alfa, static_cast<float>(range) / static_cast<float>(largest));
    }
}

void SaturationKernel::applyRow(const PixelRow& row) const {
    Tile tile;
    for (int first = 0; first < row.width; first += kTileWidth) {
        const int count = std::min(kTileWidth, row.width - first);
        loadTile(row.in, first, count, tile);
        for (int i = 0; i < count; ++i)
            tile.saturation[i] = mSaturations[static_cast<std::size_t>(tile.place[i])];
        convertTile(tile, count);
        storeTile(tile, row.out, first, count);
    }
}

void SaturationKernel::applyRowPlain(const PixelRow& row) const {
    mapPixels(row, [this](int r, int g, int b) { return resaturate(r, g, b); });
}

PixelMath::Rgb SaturationKernel::resaturate(int r, int g, int b) const {
    const int largest = std::max({r, g, b});
    const int range = largest - std::min({r, g, b});
    const float saturation = mSaturations[static_cast<std::size_t>(largest * 256 + range)];
    const float v = static_cast<float>(largest) / 255;
    const std::array<float, 3> c = fromHsv(hueOf(r, g, b, largest, range), saturation, v);
    return {PixelMath::trunc(255 * c[0]), PixelMath::trunc(255 * c[1]), PixelMath::trunc(255 * c[2])};
}

} // namespace orvela
