#include "Filters/CAuto_Color.h"

#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

constexpr std::array kNames = {"Red", "Green", "Blue"};
constexpr std::array kLeftEnds = {255, 254, 254};

// The first bin from the right that, with its two lower neighbours, exceeds the threshold.
std::optional<int> scanThreeBins(const Histogram& bins, double threshold) {
    for (std::size_t i = 255; i >= 2; --i) {
        if (bins[i] > threshold && bins[i - 1] > threshold && bins[i - 2] > threshold)
            return static_cast<int>(i);
    }
    return std::nullopt;
}

bool flattens(float s) {
    return s > 0.5F && s <= 0.75F;
}

} // namespace

const TaskDescription& CAuto_Color::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CAuto_Color",
        .line = 195,
        .dumpName = "CAuto_Color",
        .opening = "Applying CAuto_Color filter from plane at 0x%x to plane at 0x%x...",
        .completion = "CAuto_Color_I filter complete.",
    };
    return kDescription;
}

bool CAuto_Color::applies() {
    return mParams->mSliderParams.mAuto_Color_Enabled;
}

void CAuto_Color::setUp() {
    logFlags();
    const float s = mParams->mSliderParams.mAuto_Color_Value / 1000;
    mParams->Shift_Level = s;
    const double threshold = (s * 6.67 - 3.67) * std::sqrt(static_cast<double>(picturePixels()));
    Log::log(LogLevel::Debug, "AUTO COLOR threshold=: %f", threshold);

    const auto histograms = TonalStretch::channelHistograms(*mParams);
    for (std::size_t c = 0; c < 3; ++c) {
        auto& [black, white] = mLimits[c];
        if (const auto i = TonalStretch::scanLeft(*histograms[c], threshold, kLeftEnds[c])) {
            black = leftLimit(*i, s);
            Log::log(LogLevel::Debug, "i= C_%s_Left_limit:%d %f", kNames[c], *i, static_cast<double>(black));
        }
        if (const auto i = scanThreeBins(*histograms[c], threshold)) {
            white = rightLimit(*i, s);
            Log::log(LogLevel::Debug, "i= C_%s_Right_limit:%d %f", kNames[c], *i, static_cast<double>(white));
        }
        mCurves[c] =
            makeTable([limits = mLimits[c]](int value) { return curve(value, limits.black, limits.white); });
    }
}

void CAuto_Color::logFlags() const {
    Log::log(LogLevel::Debug, "Shift_Level: %f",
             static_cast<double>(mParams->mSliderParams.mAuto_Color_Value / 1000));
    Log::log(LogLevel::Debug, "Auto_Color_Enabled %d", mParams->mSliderParams.mAuto_Color_Enabled);
    Log::log(LogLevel::Debug, "Normal_Picture %d", mParams->Normal_Picture);
    Log::log(LogLevel::Debug, "Dark_middle %d", mParams->Dark_middle);
    Log::log(LogLevel::Debug, "Under_Exposed_Picture==OFF %d", !mParams->Under_Exposed_Picture);
    // The level that the filter before left behind: this filter's own comes after.
    Log::log(LogLevel::Debug, "(Bicromic==OFF || Shift_Level>0.5f) %d",
             !mParams->Bicromic || mParams->Shift_Level > 0.5F);
}

float CAuto_Color::leftLimit(int i, float s) {
    const double bin = i;
    if (flattens(s))
        return static_cast<float>(bin / 2 + bin / 2 * s / std::cosh((bin - bin / 2) / 70));
    const auto limit = static_cast<float>(bin * s);
    return s <= 0.5F ? std::min(limit, 120.0F) : limit;
}

float CAuto_Color::rightLimit(int i, float s) {
    const double bin = i;
    if (flattens(s))
        return static_cast<float>(255 - (255 - bin) / 2 * (1 / std::cosh((bin - bin / 2) / 70) + 1) * s);
    return static_cast<float>(255 - (255 - bin) * s);
}

std::uint8_t CAuto_Color::curve(int value, float black, float white) {
    const float pulled = std::trunc(TonalStretch::pullShadows(static_cast<float>(value), black));
    return static_cast<std::uint8_t>(TonalStretch::liftHighlights(pulled, white));
}

void CAuto_Color::mapRow(const PixelRow& row) const {
    mapChannels({&mCurves[0], &mCurves[1], &mCurves[2]}, row);
}
