#include "Filters/Kernels/MoireKernel.h"

#include "Filters/Kernels/PixelMath.h"
#include "Filters/Kernels/Simd.h"

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

constexpr int kWindow = 2 * MoireKernel::kRadius + 1;
constexpr int kTolerance = 15; // levels
constexpr int kTileWidth = 256;

// The average's distance from the host is kTolerance + 1 at the limit. Estimates in single precision lie
// within a thousandth of it; this far from the limit they decide.
constexpr float kSurelyNear = kTolerance + 1 - 0.1F;
constexpr float kSurelyFar = kTolerance + 1 + 0.1F;

void copyPixel(const ConstRow& from, const Row& to, int x) {
    for (std::size_t c = 0; c < to.size(); ++c)
        to[c][x] = from[c][x];
}

} // namespace

// One channel of a run of pixels with whole windows.
struct MoireKernel::Tile {
    std::int16_t rows[kWindow][kTileWidth + 2 * kRadius];
    std::int16_t sums[2 * kRadius * kRadius + 1][kTileWidth]; // of the minima, by squared distance
    float average[kTileWidth];                                // estimate
    float nearest[kTileWidth]; // estimated distance from the host, the smallest of the channels so far

    void load(const CARGBPlane& in, std::size_t channel, int y, int first, int count);
    void addMinima(int dy, int dx, int count);
    void addClass(std::size_t distance, float share, int count);
    int compare(const std::uint8_t* host, int count);
};

void MoireKernel::Tile::load(const CARGBPlane& in, std::size_t channel, int y, int first, int count) {
    for (int wy = 0; wy < kWindow; ++wy) {
        const std::uint8_t* from = in.row(y + wy - kRadius)[channel] + first - kRadius;
        std::copy_n(from, count + 2 * kRadius, rows[wy]);
    }
    for (auto& sum : sums)
        std::fill_n(sum, count, std::int16_t{0});
    std::fill_n(average, count, 0.0F);
}

ORVELA_SIMD void MoireKernel::Tile::addMinima(int dy, int dx, int count) {
    const std::int16_t* centre = rows[kRadius] + kRadius;
    const std::int16_t* neighbour = rows[kRadius + dy] + kRadius + dx;
    std::int16_t* sum = sums[dx * dx + dy * dy];
    for (int i = 0; i < count; ++i)
        sum[i] = static_cast<std::int16_t>(sum[i] + std::min(centre[i], neighbour[i]));
}

ORVELA_SIMD void MoireKernel::Tile::addClass(std::size_t distance, float share, int count) {
    for (int i = 0; i < count; ++i)
        average[i] += share * static_cast<float>(sums[distance][i]);
}

// How many pixels may still differ in all channels.
ORVELA_SIMD int MoireKernel::Tile::compare(const std::uint8_t* host, int count) {
    int left = 0;
    for (int i = 0; i < count; ++i) {
        const float distance = std::abs(average[i] - static_cast<float>(host[i]));
        nearest[i] = distance < nearest[i] ? distance : nearest[i];
        left += nearest[i] < kSurelyNear ? 0 : 1;
    }
    return left;
}

MoireKernel::MoireKernel(float position) {
    const auto sigma = static_cast<float>(static_cast<double>(position) * 1.5 / 1000 + 0.5);
    const float variance = sigma * sigma;
    const float denominator = 2 * (variance * variance);
    for (std::size_t i = 0; i < mGauss.size(); ++i)
        mGauss[i] = static_cast<float>(1 / std::exp(static_cast<double>(i) / denominator));
    double total = 0;
    for (int dy = -kRadius; dy <= kRadius; ++dy) {
        for (int dx = -kRadius; dx <= kRadius; ++dx)
            total += static_cast<double>(mGauss[static_cast<std::size_t>(dx * dx + dy * dy)]);
    }
    std::transform(mGauss.begin(), mGauss.end(), mShares.begin(),
                   [total](float weight) { return static_cast<float>(weight / total); });
}

void MoireKernel::applyRow(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y) const {
    const int first = kRadius;
    const int last = in.width() - 1 - kRadius;
    if (y < kRadius || y >= in.height() - 1 - kRadius || last <= first) {
        applyRowPlain(in, host, out, y);
        return;
    }
    decidePixels(in, host, out, y, 0, first);
    for (int x = first; x < last; x += kTileWidth)
        decideTile(in, host, out, y, x, std::min(kTileWidth, last - x));
    decidePixels(in, host, out, y, last, in.width());
}

void MoireKernel::applyRowPlain(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y) const {
    decidePixels(in, host, out, y, 0, in.width());
}

void MoireKernel::decidePixels(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y, int first,
                               int last) const {
    for (int x = first; x < last; ++x)
        copyPixel(differs(in, host, x, y) ? host : in.row(y), out.row(y), x);
}

// Estimates decide nearly all pixels; most tiles after their first channel.
void MoireKernel::decideTile(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y, int first,
                             int count) const {
    const ConstRow here = in.row(y);
    const Row target = out.row(y);
    Tile tile;
    std::fill_n(tile.nearest, count, 255.0F);
    int left = count;
    for (std::size_t c = 0; c < 3 && left > 0; ++c) {
        tile.load(in, c, y, first, count);
        for (int dy = -kRadius; dy <= kRadius; ++dy) {
            for (int dx = -kRadius; dx <= kRadius; ++dx)
                tile.addMinima(dy, dx, count);
        }
        for (const std::size_t distance : {0U, 1U, 2U, 4U, 5U, 8U})
            tile.addClass(distance, mShares[distance], count);
        left = tile.compare(host[c] + first, count);
    }
    for (std::size_t c = 0; c < 3; ++c)
        std::copy_n(here[c] + first, count, target[c] + first);
    for (int i = 0; i < count && left > 0; ++i) {
        const float distance = tile.nearest[i];
        if (distance < kSurelyNear)
            continue;
        --left;
        if (distance > kSurelyFar || differs(in, host, first + i, y))
            copyPixel(host, target, first + i);
    }
}

// The first channel that is near the host's decides.
bool MoireKernel::differs(const CARGBPlane& in, const ConstRow& host, int x, int y) const {
    const int left = std::max(x - kRadius, 0);
    const int right = std::min(x + kRadius, in.width() - 2);
    const int top = std::max(y - kRadius, 0);
    const int bottom = std::min(y + kRadius, in.height() - 2);
    if (right < left || bottom < top)
        return false;
    for (std::size_t c = 0; c < 3; ++c) {
        const std::uint8_t centre = in.row(y)[c][x];
        double sum = 0;
        double weightSum = 0;
        for (int wy = top; wy <= bottom; ++wy) {
            const std::uint8_t* window = in.row(wy)[c];
            for (int wx = left; wx <= right; ++wx) {
                const double weight =
                    mGauss[static_cast<std::size_t>((wx - x) * (wx - x) + (wy - y) * (wy - y))];
                sum += std::min(centre, window[wx]) * weight;
                weightSum += weight;
            }
        }
        const auto average = static_cast<float>(sum / weightSum);
        if (std::abs(PixelMath::trunc(average - static_cast<float>(host[c][x]))) <= kTolerance)
            return false;
    }
    return true;
}

} // namespace orvela
