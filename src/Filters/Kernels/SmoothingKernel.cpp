#include "Filters/Kernels/SmoothingKernel.h"

#include "Filters/Kernels/Simd.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace orvela {

namespace {

constexpr int kWindow = 2 * SmoothingKernel::kRadius + 1;
constexpr int kTileColumns = 256;

// Five rows of one channel around a run of columns, with the window's margin on both sides.
using TileChannel = float[kWindow][kTileColumns + 2 * SmoothingKernel::kRadius];

struct Tile {
    TileChannel channel[3];
    float variation[kTileColumns];
    float brightness[kTileColumns];
    float average[3][kTileColumns];
};

ORVELA_SIMD void loadRow(const std::uint8_t* in, float* out, int count) {
    for (int i = 0; i < count; ++i)
        out[i] = in[i];
}

// Adds one window position for all columns; the sums of each column grow in the order of the calls.
ORVELA_SIMD void addPosition(Tile& tile, int wy, int wx, int count) {
    const float* r0 = tile.channel[0][2] + 2;
    const float* g0 = tile.channel[1][2] + 2;
    const float* b0 = tile.channel[2][2] + 2;
    const float* r = tile.channel[0][wy] + wx;
    const float* g = tile.channel[1][wy] + wx;
    const float* b = tile.channel[2][wy] + wx;
    for (int i = 0; i < count; ++i) {
        const float dr = r0[i] - r[i];
        const float dg = g0[i] - g[i];
        const float db = b0[i] - b[i];
        tile.variation[i] += std::sqrt(dr * dr + dg * dg + db * db);
        tile.brightness[i] += r[i] + g[i] + b[i];
    }
}

// Sums of each class of equal distance (exact in single precision), times the class weight, in order of the
// class.
ORVELA_SIMD void averageChannel(const TileChannel& rows, const float* gauss, float* average, int count) {
    for (int i = 0; i < count; ++i) {
        const float* up2 = rows[0] + i + 2;
        const float* up = rows[1] + i + 2;
        const float* mid = rows[2] + i + 2;
        const float* down = rows[3] + i + 2;
        const float* down2 = rows[4] + i + 2;
        const float d1 = mid[-1] + mid[1] + up[0] + down[0];
        const float d2 = up[-1] + up[1] + down[-1] + down[1];
        const float d4 = mid[-2] + mid[2] + up2[0] + down2[0];
        const float d5 = up[-2] + up[2] + down[-2] + down[2] + up2[-1] + up2[1] + down2[-1] + down2[1];
        const float d8 = up2[-2] + up2[2] + down2[-2] + down2[2];
        float sum = gauss[0] * mid[0];
        sum += gauss[1] * d1;
        sum += gauss[2] * d2;
        sum += gauss[4] * d4;
        sum += gauss[5] * d5;
        sum += gauss[8] * d8;
        average[i] = sum / 20;
    }
}

} // namespace

SmoothingKernel::SmoothingKernel(double threshold) : mThreshold(static_cast<float>(threshold)) {
    if (mThreshold < threshold)
        mThreshold = std::nextafter(mThreshold, std::numeric_limits<float>::infinity());
    for (std::size_t i = 0; i <= 2 * kRadius * kRadius; ++i)
        mGauss[i] = static_cast<float>(1 / (std::exp(static_cast<double>(i) / 6.25) * 0.72));
}

void SmoothingKernel::applyRow(const CARGBPlane& in, CARGBPlane& out, int y, int first, int last) const {
    Tile tile;
    const Row target = out.row(y);
    for (int start = first; start < last; start += kTileColumns) {
        const int count = std::min(kTileColumns, last - start);
        std::fill_n(tile.variation, count, 0.0F);
        std::fill_n(tile.brightness, count, 0.0F);
        for (int wy = 0; wy < kWindow; ++wy) {
            const ConstRow row = in.row(y + wy - kRadius);
            for (std::size_t c = 0; c < 3; ++c)
                loadRow(row[c] + start - kRadius, tile.channel[c][wy], count + 2 * kRadius);
        }
        for (int wy = 0; wy < kWindow; ++wy) {
            for (int wx = 0; wx < kWindow; ++wx)
                addPosition(tile, wy, wx, count);
        }
        for (std::size_t c = 0; c < 3; ++c)
            averageChannel(tile.channel[c], mGauss.data(), tile.average[c], count);
        for (int i = 0; i < count; ++i) {
            if (!(tile.variation[i] / (tile.brightness[i] / Gauss_denominator) < mThreshold))
                continue;
            for (std::size_t c = 0; c < 3; ++c)
                target[c][start + i] = static_cast<std::uint8_t>(tile.average[c][i]);
        }
    }
}

void SmoothingKernel::applyRowPlain(const CARGBPlane& in, CARGBPlane& out, int y, int first, int last) const {
    constexpr int kClasses[] = {0, 1, 2, 4, 5, 8};
    const Row target = out.row(y);
    for (int x = first; x < last; ++x) {
        if (!isSmooth(in, x, y))
            continue;
        for (std::size_t c = 0; c < 3; ++c) {
            std::array<int, 9> sums = {};
            for (int dy = -kRadius; dy <= kRadius; ++dy) {
                for (int dx = -kRadius; dx <= kRadius; ++dx)
                    sums[static_cast<std::size_t>(dx * dx + dy * dy)] += in.row(y + dy)[c][x + dx];
            }
            float total = 0;
            for (const int distance : kClasses) {
                const auto d = static_cast<std::size_t>(distance);
                total += mGauss[d] * static_cast<float>(sums[d]);
            }
            target[c][x] = static_cast<std::uint8_t>(total / 20);
        }
    }
}

bool SmoothingKernel::isSmooth(const CARGBPlane& in, int x, int y) const {
    const ConstRow centre = in.row(y);
    int brightness = 0;
    float variation = 0;
    for (int wy = y - kRadius; wy <= y + kRadius; ++wy) {
        const ConstRow window = in.row(wy);
        for (int wx = x - kRadius; wx <= x + kRadius; ++wx) {
            int square = 0;
            for (std::size_t c = 0; c < 3; ++c) {
                const int difference = centre[c][x] - window[c][wx];
                square += difference * difference;
                brightness += window[c][wx];
            }
            variation += std::sqrt(static_cast<float>(square));
        }
    }
    return variation / (static_cast<float>(brightness) / Gauss_denominator) < mThreshold;
}

} // namespace orvela
