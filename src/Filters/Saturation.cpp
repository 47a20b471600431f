#include "Filters/Saturation.h"

#include "Filters/Kernels/ScaledTile.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"
#include "Utility/RowScheduler.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

constexpr double kWidth = 11; // of the window around a channel mean
constexpr unsigned kRowGrain = 16;

} // namespace

const TaskDescription& Saturation::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/Saturation",
        .line = 146,
        .dumpName = "Saturation",
        .start = "Applying Saturation filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CSaturation Condition matched.",
        .completion = "Saturation Filter complete.",
    };
    return kDescription;
}

bool Saturation::applies() {
    return mParams->mSliderParams.SaturationEnabled;
}

void Saturation::setUp() {
    chooseStrength(mParams->mSliderParams.SaturationValue);
    Log::log(LogLevel::Debug, " Saturation alfa: %f", static_cast<double>(mAlfa));
    mStep = PixelMath::samplingStep(mInPlane->width(), mInPlane->height());
    Log::log(LogLevel::Debug, " Saturation Histo_Step %d", mStep);
    const Means means = ofWholePicture(measure(*mInPlane, mStep));
    mMeanIn = restoresOriginalLuma() ? mParams->m_OriginalLuma0 : means.all;
    Log::log(LogLevel::Debug, " Saturation mean_in %f", static_cast<double>(mMeanIn));
    if (mDominant)
        prepareDominant(means);
    else
        mHsv.emplace(mChange, mAlfa);
}

void Saturation::chooseStrength(float position) {
    const int n = PixelMath::trunc(position);
    const double above = static_cast<double>(position) - 500;
    mDominant = n >= 500 && n <= 600;
    mChange = n < 500 ? SaturationKernel::Change::Lower : SaturationKernel::Change::Raise;
    if (mDominant)
        mStrength = static_cast<float>(above / 200);
    else if (n > 600)
        mAlfa = static_cast<float>(above / 500 + 0.2);
    else
        mAlfa = static_cast<float>(1 - static_cast<double>(position) / 500);
}

// What the plane's own means say of the whole picture's is kept for the means of the result.
Saturation::Means Saturation::ofWholePicture(const Means& here) {
    std::array numbers = {here.all, here.r, here.g, here.b};
    mKnowsWhole = measured(numbers);
    const Means whole = {numbers[0], numbers[1], numbers[2], numbers[3]};
    mWholeShare = here.all > 0 ? whole.all / here.all : 1.0F;
    return whole;
}

// Means over the samples up to `margin` before the last column and row; 0 without a sample.
Saturation::Means Saturation::measure(const CARGBPlane& plane, int margin) const {
    std::array<std::uint64_t, 3> sums = {};
    std::uint64_t samples = 0;
    for (int y = 0; y < plane.height() - margin; y += mStep) {
        const ConstRow row = plane.row(y);
        for (int x = 0; x < plane.width() - margin; x += mStep) {
            for (std::size_t c = 0; c < 3; ++c)
                sums[c] += row[c][x];
            ++samples;
        }
    }
    if (samples == 0)
        return {};
    const auto mean = [](std::uint64_t sum, std::uint64_t count) {
        return static_cast<float>(static_cast<double>(sum) / static_cast<double>(count));
    };
    return {mean(sums[0] + sums[1] + sums[2], 3 * samples), mean(sums[0], samples), mean(sums[1], samples),
            mean(sums[2], samples)};
}

// After an illumination iteration the brightness to restore is the unprocessed picture's.
bool Saturation::restoresOriginalLuma() const {
    const CSliderParams& sliders = mParams->mSliderParams;
    return mKnowsWhole && (sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled) &&
           !mParams->Switch_TOO_SHARP && mParams->Normal_Picture && !mParams->Under_Exposed_Picture &&
           !isAutomaticMode(sliders);
}

void Saturation::prepareDominant(const Means& means) {
    const float max = std::max({means.r, means.g, means.b});
    const float min = std::min({means.r, means.g, means.b});
    const float middle = std::max(std::min(means.r, means.g), std::min(std::max(means.r, means.g), means.b));
    const bool pulls = mParams->mSliderParams.SaturationValue < 600;
    const auto curve = [&](float mean) {
        const float distance = mean == middle ? max - middle : max - min;
        return makeTable<WideTable>([=, this](int c) {
            if (!pulls || mean >= max)
                return c;
            const double below = max - c;
            const double slope = below == 0 ? 0 : below / (mean * 0.025);
            const double pull =
                1 / std::cosh((static_cast<double>(c) - mean) / kWidth) * (std::tanh(slope) + 1);
            const auto value = static_cast<float>(c - pull * distance * mStrength / 2);
            return PixelMath::trunc(std::max(value, 0.0F));
        });
    };
    mCurves = {curve(means.r), curve(means.g), curve(means.b)};
}

void Saturation::mapRow(const PixelRow& row) const {
    if (mDominant)
        mapKeepingHue(mCurves, row);
    else
        mHsv->applyRow(row);
}

// An excerpt takes the ratio of the whole picture where that was found at the same strength, and else
// estimates it.
float Saturation::lumaRatio() {
    const float meanOut = measure(*mOutPlane, mStep + 1).all * mWholeShare;
    Log::log(LogLevel::Debug, " Saturation mean_out %f", static_cast<double>(meanOut));
    const float ratio = meanOut > 0 ? mMeanIn / meanOut : 1.0F;
    const float position = mParams->mSliderParams.SaturationValue;
    std::array numbers = {position, ratio};
    return measured(numbers) && numbers[0] == position ? numbers[1] : ratio;
}

void Saturation::complete() {
    const float ratio = lumaRatio();
    Log::log(LogLevel::Debug, " Saturation Radion_iso_Luma %f", static_cast<double>(ratio));
    const auto height = static_cast<unsigned>(mOutPlane->height());
    forEachRange(0, height, kRowGrain, [&](unsigned first, unsigned last) {
        for (unsigned y = first; y < last; ++y) {
            const Row row = mOutPlane->row(static_cast<int>(y));
            recolourRow(row, 0, mOutPlane->width(), [&row, ratio](ScaledTile& tile, int i, int x) {
                tile.set(i, {row[0][x], row[1][x], row[2][x]}, ratio);
            });
        }
    });
}
