#include "Filters/CAuto_Contrast_TEST.h"

#include "Filters/Kernels/HistogramRecount.h"
#include "Filters/Kernels/PixelMath.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

const TaskDescription& CAuto_Contrast_TEST::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CAuto_Contrast_TEST",
        .line = 315,
        .dumpName = "CAuto_Contrast_TEST",
        .start = "Applying CAuto_Contrast_TEST filter ",
        .completion = "CAuto_Contrast_TEST Filter complete.",
    };
    return kDescription;
}

bool CAuto_Contrast_TEST::applies() {
    const CSliderParams& s = mParams->mSliderParams;
    const bool corrected = s.AutoContrast_Enabled || LevelSwitches::anyPerceptual(s) ||
                           s.OrvelaLevelEnabled || s.OrvelaLevel2Enabled;
    const bool plain = isAutomaticMode(s) || !corrected;
    const bool manual =
        LevelSwitches::anyAbsolute(s) || s.BrightnessEnabled || s.ContrastEnabled || s.GammaCorrectionEnabled;
    const bool purelyAutomatic = !manual && plain && !s.ClarityFilterEnabled && mParams->Normal_Picture &&
                                 !mParams->Under_Exposed_Picture;
    return !s.mAuto_Color_Enabled && !purelyAutomatic;
}

void CAuto_Contrast_TEST::setUp() {
    Log::log(LogLevel::Debug, "CAuto_Contrast_TEST Condition matched and Soft_Orvela is %d.",
             mParams->Soft_Orvela);
    measured([this] { recountHistograms(*mInPlane, *mParams, 3, 3); });

    const int pixels = picturePixels();
    mThreshold = PixelMath::trunc(TonalStretch::baseThreshold(pixels));
    const int root = PixelMath::trunc(std::sqrt(static_cast<double>(pixels)));
    TonalStretch::Limits luma;
    mHazy = TonalStretch::storeHaze(*mParams, luma, mThreshold, root < 700 ? 0 : root);
    if (!mHazy)
        readChannelLimits();
    C_Left_limit = luma.black;
    C_Right_limit = luma.white;
    mHazyCurve = makeTable([this](int value) {
        return TonalStretch::stretchHazy(value, {C_Left_limit, C_Right_limit});
    });
}

void CAuto_Contrast_TEST::readChannelLimits() {
    static constexpr std::array kNames = {'R', 'G', 'B'};
    Log::log(LogLevel::Debug, "threshold: %f ", static_cast<double>(mThreshold));
    const auto histograms = TonalStretch::channelHistograms(*mParams);
    std::array<TonalStretch::Limits, 3> channels;
    for (std::size_t c = 0; c < 3; ++c) {
        if (const auto i = TonalStretch::scanLeft(*histograms[c], mThreshold, 253)) {
            channels[c].black = *i;
            Log::log(LogLevel::Debug, "Left_Limit_%c: %d", kNames[c], *i);
        }
        if (const auto i = TonalStretch::scanRight(*histograms[c], mThreshold, 2)) {
            channels[c].white = *i;
            Log::log(LogLevel::Debug, "Right_Limit_%c: %d", kNames[c], *i);
        }
    }
    mLimits = TonalStretch::combine(channels);
    const int range = mLimits.white - mLimits.black;
    mFactor = range > 0 ? static_cast<float>(255.0 / range) : 1.0F;
    mCurve = makeTable<WideTable>([this](int value) { return stretch(value, mLimits.black, mFactor); });
}

int CAuto_Contrast_TEST::stretch(int value, int black, float factor) {
    return PixelMath::trunc(static_cast<float>(value - black) * factor);
}

void CAuto_Contrast_TEST::mapRow(const PixelRow& row) const {
    if (mHazy) {
        mapChannels(mHazyCurve, row);
        return;
    }
    mapPixels(row, [this](std::uint8_t r, std::uint8_t g, std::uint8_t b) {
        if (std::min({r, g, b}) < mLimits.black)
            return PixelMath::Rgb{r, g, b};
        return PixelMath::keepHue({mCurve[r], mCurve[g], mCurve[b]});
    });
}
