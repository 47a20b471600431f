#include "Filters/Kernels/IlluminationKernel.h"

#include "Filters/Kernels/Simd.h"
#include "Utility/RowScheduler.h"

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

constexpr double kGainScale = 1.44;
constexpr int kTile = 512;                             // columns worked on at a time
constexpr int kSums = 968;                             // 255 * (1 + 2 * 0.9469 + 0.8983), truncated, and 0
constexpr std::int32_t kTablePixels = 4 * kSums * 256; // from here on the table costs less than it saves

// Places in the table for a run of interior samples, from the row above and the row itself.
ORVELA_SIMD void findPlaces(const std::uint8_t* above, const std::uint8_t* here, const float* weights,
                            int* places, int count) {
    const float w0 = weights[0];
    const float w1 = weights[1];
    const float w2 = weights[2];
    for (int i = 0; i < count; ++i) {
        const float sum = ((w2 * static_cast<float>(above[i - 1]) + w1 * static_cast<float>(above[i])) +
                           w1 * static_cast<float>(here[i - 1])) +
                          w0 * static_cast<float>(here[i]);
        places[i] = here[i] * kSums + static_cast<int>(sum);
    }
}

} // namespace

IlluminationKernel::IlluminationKernel(float epsilon, std::int32_t pixelCount) : mEpsilon(epsilon) {
    for (std::size_t d = 0; d < mWeights.size(); ++d) {
        const double distance = static_cast<float>(std::sqrt(static_cast<double>(d)));
        mWeights[d] = static_cast<float>(1 / std::cosh(distance / 3));
    }
    mInteriorFactor = factor(((mWeights[2] + mWeights[1]) + mWeights[1]) + mWeights[0]);
    if (pixelCount >= kTablePixels)
        buildTable();
}

float IlluminationKernel::factor(float weightSum) const {
    return static_cast<float>(static_cast<double>(weightSum) * 255 / mEpsilon);
}

std::uint8_t IlluminationKernel::result(std::uint8_t sample, int sum, float k) {
    const double r = sample * static_cast<double>(k) / (sum + 1) - 2;
    const double gain = 1 + std::tanh(r);
    const auto value = static_cast<float>(gain * sample / kGainScale);
    return static_cast<std::uint8_t>(std::min(255, static_cast<int>(std::floor(value))));
}

void IlluminationKernel::buildTable() {
    mTable.resize(256 * kSums);
    orvela::forEachRange(0, 256, 8, [this](unsigned first, unsigned last) {
        for (unsigned sample = first; sample < last; ++sample) {
            for (int sum = 0; sum < kSums; ++sum)
                mTable[sample * kSums + static_cast<unsigned>(sum)] =
                    result(static_cast<std::uint8_t>(sample), sum, mInteriorFactor);
        }
    });
}

void IlluminationKernel::applyRow(const CARGBPlane& in, CARGBPlane& out, int y) const {
    const int last = in.width() - 1;
    if (mTable.empty() || y == 0 || y == in.height() - 1 || last < 2) {
        applyRowPlain(in, out, y);
        return;
    }
    applyPixel(in, out, 0, y);
    const ConstRow above = in.row(y - 1);
    const ConstRow here = in.row(y);
    const Row target = out.row(y);
    std::array<int, kTile> places;
    for (std::size_t c = 0; c < 3; ++c) {
        for (int x = 1; x < last; x += kTile) {
            const int count = std::min(kTile, last - x);
            findPlaces(above[c] + x, here[c] + x, mWeights.data(), places.data(), count);
            for (int i = 0; i < count; ++i)
                target[c][x + i] = mTable[static_cast<std::size_t>(places[static_cast<std::size_t>(i)])];
        }
    }
    applyPixel(in, out, last, y);
}

void IlluminationKernel::applyRowPlain(const CARGBPlane& in, CARGBPlane& out, int y) const {
    for (int x = 0; x < in.width(); ++x)
        applyPixel(in, out, x, y);
}

// The window's upper bounds are exclusive and stop before the last column and row: there a pixel is not part
// of its own surround, and on a picture one pixel wide or high the window is empty.
void IlluminationKernel::applyPixel(const CARGBPlane& in, CARGBPlane& out, int x, int y) const {
    const int left = std::max(x - 1, 0);
    const int right = std::min(x + 1, in.width() - 1);
    const int top = std::max(y - 1, 0);
    const int bottom = std::min(y + 1, in.height() - 1);
    std::array<float, 3> sums = {};
    float weightSum = 0;
    for (int wy = top; wy < bottom; ++wy) {
        const ConstRow window = in.row(wy);
        for (int wx = left; wx < right; ++wx) {
            const float weight =
                mWeights[static_cast<std::size_t>((wx - x) * (wx - x) + (wy - y) * (wy - y))];
            for (std::size_t c = 0; c < 3; ++c)
                sums[c] += weight * window[c][wx];
            weightSum += weight;
        }
    }
    const float k = factor(weightSum);
    const ConstRow here = in.row(y);
    const Row target = out.row(y);
    for (std::size_t c = 0; c < 3; ++c)
        target[c][x] = result(here[c][x], static_cast<int>(sums[c]), k);
}

} // namespace orvela
