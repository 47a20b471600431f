#include "Filters/Auto_Contrast.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

// One channel mean, doubled, is below both others.
bool lacksOneColour(const CUserParams& params) {
    const float r = params.m_OriginalLumaR;
    const float g = params.m_OriginalLumaG;
    const float b = params.m_OriginalLumaB;
    return (2 * b < r && 2 * b < g) || (2 * g < r && 2 * g < b) || (2 * r < g && 2 * r < b);
}

} // namespace

const TaskDescription& Auto_Contrast::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/Auto_Contrast",
        .line = 325,
        .dumpName = "Auto_Contrast",
        .opening = "Applying CAuto_Contrast filter from plane at 0x%x to plane at 0x%x...",
        .completion = "Auto Contrast filter complete.",
    };
    return kDescription;
}

bool Auto_Contrast::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    mParams->Bicromic = lacksOneColour(*mParams);
    return sliders.AutoContrast_Enabled && !mParams->Bicromic && !sliders.Brightness2Enabled &&
           !sliders.ContrastEnabled && !sliders.BrightnessEnabled && !mParams->Under_Exposed_Picture;
}

void Auto_Contrast::setUp() {
    Log::log(LogLevel::Debug, "IN 2 AUTOCONTRAST MODE DETECTED");
    Log::log(LogLevel::Debug, "Bicromic:%d", mParams->Bicromic);
    mParams->Shift_Level = 1.0F;
    scanChannels(PixelMath::trunc(TonalStretch::baseThreshold(picturePixels())));
    mParams->m_Opaco = mLimits.isHazy();
    scanChannels(chooseThreshold());
    mCurve = makeTable([this](int value) {
        return mParams->m_Opaco ? hazyCurve(value, mLimits) : normalCurve(value, mLimits);
    });
}

// A scan that finds nothing keeps the limit of the pass before.
void Auto_Contrast::scanChannels(double threshold) {
    static constexpr std::array kLeftNames = {"C_Red", "C_Green", " C_Blue"};
    static constexpr std::array kNames = {"C_Red", "C_Green", "C_Blue"};
    static constexpr std::array kLeftEnds = {255, 254, 254};
    const auto histograms = TonalStretch::channelHistograms(*mParams);
    threshold *= mParams->Shift_Level;
    for (std::size_t c = 0; c < 3; ++c) {
        if (const auto i = TonalStretch::scanLeft(*histograms[c], threshold, kLeftEnds[c])) {
            mChannels[c].black = *i;
            Log::log(LogLevel::Debug, "i= %s_Left_limit:%d %f", kLeftNames[c], *i, static_cast<double>(*i));
        }
        if (const auto i = TonalStretch::scanRight(*histograms[c], threshold, 2)) {
            mChannels[c].white = *i;
            Log::log(LogLevel::Debug, "i= %s_Right_limit:%d %f", kNames[c], *i, static_cast<double>(*i));
        }
    }
    mLimits = TonalStretch::combine(mChannels);
}

// Of the second scans, in samples.
int Auto_Contrast::chooseThreshold() const {
    const double root = std::sqrt(static_cast<double>(picturePixels()));
    if (mParams->m_Opaco) {
        Log::log(LogLevel::Debug, "m_Opaco: %d ", mParams->m_Opaco);
        Log::log(LogLevel::Debug, "C_Left_limit: %f ", static_cast<double>(mLimits.black));
        Log::log(LogLevel::Debug, "C_Right_limit: %f ", static_cast<double>(mLimits.white));
        return PixelMath::trunc(root);
    }
    const int threshold = PixelMath::trunc(mParams->m_OriginalLuma < 128 ? 2 * root : root);
    Log::log(LogLevel::Debug, "threshold: %f ", static_cast<double>(threshold));
    return threshold;
}

std::uint8_t Auto_Contrast::hazyCurve(int value, TonalStretch::Limits limits) {
    const auto range = static_cast<float>(limits.white - limits.black);
    const auto above = static_cast<float>(std::max(value - limits.black, 0));
    const float stretched = (255 - range) * above / range + above;
    return std::isfinite(stretched) ? static_cast<std::uint8_t>(std::min(stretched, 255.0F)) : 255;
}

std::uint8_t Auto_Contrast::normalCurve(int value, TonalStretch::Limits limits) {
    const float pulled =
        TonalStretch::pullShadows(static_cast<float>(value), static_cast<float>(limits.black));
    return static_cast<std::uint8_t>(TonalStretch::liftHighlights(pulled, static_cast<float>(limits.white)));
}

void Auto_Contrast::mapRow(const PixelRow& row) const {
    mapChannels(mCurve, row);
}
