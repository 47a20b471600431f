#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Contrast_Brightness.h"

#include "SmartAnalyzers/ToneMass.h"

#include <algorithm>

using namespace orvela;

using namespace ToneMass;

namespace {

constexpr double kSlope = 25;
constexpr double kBrightHighlights = 170;
constexpr double kBrightShadows = 85;
constexpr double kContrastHighlights = 200;
constexpr double kContrastShadows = 55;
constexpr float kMostContrast = 60;
constexpr float kNeutralSlider = 500;

struct ChannelMass {
    Histogram CUserParams::*bins;
    double CUserParams::*high;
    double CUserParams::*low;
};

constexpr ChannelMass kLuma = {&CUserParams::pHisto_Luma, &CUserParams::C_H_F_High, &CUserParams::C_H_F_Low};
constexpr ChannelMass kColors[] = {
    {&CUserParams::pHisto_Red, &CUserParams::C_H_F_High_R, &CUserParams::C_H_F_Low_R},
    {&CUserParams::pHisto_Green, &CUserParams::C_H_F_High_G, &CUserParams::C_H_F_Low_G},
    {&CUserParams::pHisto_Blue, &CUserParams::C_H_F_High_B, &CUserParams::C_H_F_Low_B},
};

void resetMasses(CUserParams& params) {
    params.B_H_F_High = params.B_H_F_Low = 0;
    params.m_B_H_C_F_High = params.m_B_H_C_F_Low = 0;
    params.C_H_F_High = params.C_H_F_Low = 0;
    for (const ChannelMass& color : kColors)
        params.*color.high = params.*color.low = 0;
}

void storeMasses(CUserParams& params, const ChannelMass& channel, const Curve& curve) {
    const Histogram bins = remap(params.*channel.bins, curve);
    params.*channel.high = risingMass(bins, kContrastHighlights, kSlope);
    params.*channel.low = fallingMass(bins, kContrastShadows, kSlope);
}

float contrastLimit(double mass, int pixels) {
    const double limit = inverseShare(0.10211310535669327, mass, pixels, 50);
    return std::min(static_cast<float>(limit), kMostContrast);
}

} // namespace

void CSmartAnalyzer_Perceptual_Contrast_Brightness::Analyze() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool contrast = sliders.Contrast2Enabled || sliders.mPerceptual_Contrast_Touch_Enabled;
    if (!contrast && !sliders.Brightness2Enabled && !sliders.mPerceptual_Brightness_Touch_Enabled)
        return;
    resetMasses(*mParams);
    storeBrightnessFactors();
    if (contrast)
        storeContrastFactors();
}

void CSmartAnalyzer_Perceptual_Contrast_Brightness::storeBrightnessFactors() {
    CUserParams& params = *mParams;
    const int pixels = picturePixels();
    params.B_H_F_High = static_cast<float>(risingMass(params.pHisto_Luma, kBrightHighlights, kSlope));
    params.B_H_F_Low = static_cast<float>(fallingMass(params.pHisto_Luma, kBrightShadows, kSlope));

    params.m_B_H_C_F_High = static_cast<float>(inverseShare(0.05520644, params.B_H_F_High, pixels, 70));
    const float toMiddle = 127 - params.m_OriginalLuma;
    if (toMiddle > 0 && toMiddle < params.m_B_H_C_F_High)
        params.m_B_H_C_F_High = toMiddle;
    params.m_B_H_C_F_Low = static_cast<float>(inverseShare(0.44574037, params.B_H_F_Low, pixels, 30));
}

bool CSmartAnalyzer_Perceptual_Contrast_Brightness::lifts() const {
    const CSliderParams& sliders = mParams->mSliderParams;
    const float slider = mParams->Final_Touch_Mode_Enabled ? sliders.mPerceptual_Brightness_Touch_Value
                                                           : sliders.Brightness2Value;
    return slider >= kNeutralSlider;
}

void CSmartAnalyzer_Perceptual_Contrast_Brightness::storeContrastFactors() {
    CUserParams& params = *mParams;
    const double up = params.m_B_H_C_F_High;
    const double down = params.m_B_H_C_F_Low;
    const Curve curve = lifts() ? tabulate([up](int i) { return i < 255 - up ? i + up : 255; })
                                : tabulate([down](int i) { return i > down ? i - down : 0; });
    if (params.Final_Touch_Mode_Enabled) {
        for (const ChannelMass& color : kColors)
            storeMasses(params, color, curve);
    }
    storeMasses(params, kLuma, curve);
    params.m_P_C_H_C_High = contrastLimit(params.C_H_F_High, picturePixels());
    params.m_P_C_H_C_Low = contrastLimit(params.C_H_F_Low, picturePixels());
}
