#include "Filters/Kernels/BilateralKernel.h"

#include "Filters/Kernels/Simd.h"

#include <algorithm>

namespace orvela {

namespace {

constexpr int kTileWidth = 256;

} // namespace

// A run of pixels with their neighbours, one property after the other, so that the arithmetic runs on
// vectors. Pixel i stands in column i + 1 of the middle row.
struct BilateralKernel::Tile {
    int count = 0;
    float channel[3][3][kTileWidth + 2]; // by channel and row
    int distance[kTileWidth + 1];        // in colour, squared
    float weight[3][3][kTileWidth + 1];  // by row and column of the neighbour
    double weightSum[kTileWidth];
    double sum[3][kTileWidth];
    float average[kTileWidth];

    void load(const CARGBPlane& in, int y, int first);
    void measure(int wy, int wx, int pixels);
    void addRow(int wy, const float* left, const float* middle, const float* right);
    void store(std::size_t c, std::uint8_t* out);
};

ORVELA_SIMD void BilateralKernel::Tile::load(const CARGBPlane& in, int y, int first) {
    for (int wy = 0; wy < 3; ++wy) {
        const ConstRow row = in.row(y + wy - 1);
        for (std::size_t c = 0; c < 3; ++c) {
            const std::uint8_t* from = row[c] + first - 1;
            for (int i = 0; i < count + 2; ++i)
                channel[c][wy][i] = from[i];
        }
    }
    std::fill_n(weightSum, count, 0.0);
    for (auto& values : sum)
        std::fill_n(values, count, 0.0);
}

// Exact: the squares of whole numbers add up to less than 2^24.
ORVELA_SIMD void BilateralKernel::Tile::measure(int wy, int wx, int pixels) {
    for (int i = 0; i < pixels; ++i) {
        const float r = channel[0][1][i + 1] - channel[0][wy][i + wx];
        const float g = channel[1][1][i + 1] - channel[1][wy][i + wx];
        const float b = channel[2][1][i + 1] - channel[2][wy][i + wx];
        distance[i] = static_cast<int>(r * r + g * g + b * b);
    }
}

// Adds three neighbours, left to right.
ORVELA_SIMD void BilateralKernel::Tile::addRow(int wy, const float* left, const float* middle,
                                               const float* right) {
    for (int i = 0; i < count; ++i) {
        const double l = left[i];
        const double m = middle[i];
        const double r = right[i];
        weightSum[i] = weightSum[i] + l + m + r;
        for (int c = 0; c < 3; ++c) {
            const float* value = channel[c][wy] + i;
            sum[c][i] = sum[c][i] + l * static_cast<double>(value[0]) + m * static_cast<double>(value[1]) +
                        r * static_cast<double>(value[2]);
        }
    }
}

ORVELA_SIMD void BilateralKernel::Tile::store(std::size_t c, std::uint8_t* out) {
    const int pixels = count; // which the bytes written cannot change
    for (int i = 0; i < pixels; ++i)
        average[i] = static_cast<float>(sum[c][i] / weightSum[i]);
    for (int i = 0; i < pixels; ++i)
        out[i] = static_cast<std::uint8_t>(average[i]);
}

void BilateralKernel::applyRow(const CARGBPlane& in, CARGBPlane& out, int y) const {
    Tile tile;
    const int end = in.width() - 1;
    const Row target = out.row(y);
    for (int first = 1; first < end; first += kTileWidth) {
        tile.count = std::min(kTileWidth, end - first);
        tile.load(in, y, first);
        smoothTile(tile);
        for (std::size_t c = 0; c < 3; ++c)
            tile.store(c, target[c] + first);
    }
}

// A pixel's weight for its right neighbour is that neighbour's for the pixel.
void BilateralKernel::smoothTile(Tile& tile) const {
    for (int wx = 0; wx < 3; ++wx) {
        weigh(tile, 0, wx, tile.count);
        weigh(tile, 2, wx, tile.count);
    }
    weigh(tile, 1, 0, tile.count + 1);
    std::fill_n(tile.weight[1][1], tile.count, mRange[0] * mSpatial[0]);
    tile.addRow(0, tile.weight[0][0], tile.weight[0][1], tile.weight[0][2]);
    tile.addRow(1, tile.weight[1][0], tile.weight[1][1], tile.weight[1][0] + 1);
    tile.addRow(2, tile.weight[2][0], tile.weight[2][1], tile.weight[2][2]);
}

void BilateralKernel::weigh(Tile& tile, int wy, int wx, int pixels) const {
    tile.measure(wy, wx, pixels);
    const float spatial = mSpatial[(wx - 1) * (wx - 1) + (wy - 1) * (wy - 1)];
    for (int i = 0; i < pixels; ++i)
        tile.weight[wy][wx][i] = mRange[tile.distance[i]] * spatial;
}

void BilateralKernel::applyRowPlain(const CARGBPlane& in, CARGBPlane& out, int y) const {
    const ConstRow centre = in.row(y);
    for (int x = 1; x < in.width() - 1; ++x) {
        double weightSum = 0;
        std::array<double, 3> sums = {};
        for (int dy = -1; dy <= 1; ++dy) {
            const ConstRow row = in.row(y + dy);
            for (int dx = -1; dx <= 1; ++dx) {
                int distance = 0;
                for (std::size_t c = 0; c < 3; ++c)
                    distance += (centre[c][x] - row[c][x + dx]) * (centre[c][x] - row[c][x + dx]);
                const double weight = mRange[distance] * mSpatial[dx * dx + dy * dy];
                weightSum += weight;
                for (std::size_t c = 0; c < 3; ++c)
                    sums[c] += weight * row[c][x + dx];
            }
        }
        for (std::size_t c = 0; c < 3; ++c)
            out.row(y)[c][x] = static_cast<std::uint8_t>(static_cast<float>(sums[c] / weightSum));
    }
}

} // namespace orvela
