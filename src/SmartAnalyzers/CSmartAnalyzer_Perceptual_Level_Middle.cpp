#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Level_Middle.h"

#include "Settings/Conditions.h"
#include "SmartAnalyzers/ToneMass.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

using namespace ToneMass;

namespace {

constexpr double kCenter = 100;
constexpr double kSlope = 30;
constexpr double kDarkening = 1.5384615659713745;
constexpr double kBrightening = 0.20000000298023224;
constexpr float kMostLow = 0.99F;

struct TouchChannel {
    bool CSliderParams::*enabled;
    Histogram CUserParams::*bins;
    float CUserParams::*low;
    float CUserParams::*high;
    const char* label;
};

constexpr TouchChannel kTouchChannels[] = {
    {&CSliderParams::mPerceptual_Touch_Middle_RGB_Enabled, &CUserParams::pHisto_Luma, &CUserParams::m_M_H_L_F,
     &CUserParams::m_M_H_H_F, "M_L_Low"},
    {&CSliderParams::mPerceptual_Touch_Middle_R_Enabled, &CUserParams::pHisto_Red, &CUserParams::m_M_H_L_F_R,
     &CUserParams::m_M_H_H_F_R, "M_L_Low_R"},
    {&CSliderParams::mPerceptual_Touch_Middle_G_Enabled, &CUserParams::pHisto_Green,
     &CUserParams::m_M_H_L_F_G, &CUserParams::m_M_H_H_F_G, "M_L_Low_G"},
    {&CSliderParams::mPerceptual_Touch_Middle_B_Enabled, &CUserParams::pHisto_Blue, &CUserParams::m_M_H_L_F_B,
     &CUserParams::m_M_H_H_F_B, "M_L_Low_B"},
};

Curve gammaCurve(double exponent) {
    return tabulate([exponent](int i) {
        return static_cast<float>(std::pow(static_cast<float>(i) / 255.0F, exponent)) * 255.0F;
    });
}

double lowMass(const Histogram& bins) {
    return fallingMass(remap(bins, gammaCurve(kDarkening)), kCenter, kSlope);
}

double highMass(const Histogram& bins) {
    return risingMass(remap(bins, gammaCurve(kBrightening)), kCenter, kSlope);
}

void logDarkened(const Histogram& bins) {
    if (!Log::writes(LogLevel::Debug))
        return;
    const Curve curve = gammaCurve(kDarkening);
    const Histogram darkened = remap(bins, curve);
    for (std::size_t i = 0; i < bins.size(); ++i) {
        Log::log(LogLevel::Debug, "pHisto_Luma_aux[i_aux] %f",
                 darkened[static_cast<std::size_t>(target(curve, i))]);
        Log::log(LogLevel::Debug, "pHisto_Luma[i] %f", bins[i]);
    }
}

} // namespace

void CSmartAnalyzer_Perceptual_Level_Middle::Analyze() {
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Perceptual_Level_Middle is starting.");
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool perceptual = LevelSwitches::anyPerceptual(sliders) || sliders.PerceptualGammaEnabled;
    if (!mParams->Final_Touch_Mode_Enabled) {
        if (perceptual && !sliders.GammaCorrectionEnabled && !LevelSwitches::anyAbsolute(sliders))
            storeMainFactors();
    } else if (LevelSwitches::touchPerceptualMiddle(sliders)) {
        storeTouchFactors();
    }
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Perceptual_Level_Middle finished..");
}

void CSmartAnalyzer_Perceptual_Level_Middle::storeMainFactors() {
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Perceptual_Level_Middle Condition matched.");
    CUserParams& params = *mParams;
    logDarkened(params.pHisto_Luma);
    params.m_M_L_C_F_Hight =
        static_cast<float>(inverseShare(0.7267330288887024, highMass(params.pHisto_Luma), pixels(), 1));
    params.m_M_L_C_F_Low = static_cast<float>(lowMass(params.pHisto_Luma) / pixels() * 0.6163860327556137);
    params.m_M_H_L_F = std::min(params.m_M_L_C_F_Low, kMostLow);
    params.m_M_H_H_F = 2 * params.m_M_L_C_F_Hight;
}

void CSmartAnalyzer_Perceptual_Level_Middle::storeTouchFactors() {
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Perceptual_Level_Middle_TOUCH  Condition matched.");
    CUserParams& params = *mParams;
    Log::log(LogLevel::Debug, "iImageSize %f", static_cast<double>(mInPlane->pixelCount()));
    for (const TouchChannel& channel : kTouchChannels) {
        if (!(params.mSliderParams.*channel.enabled))
            continue;
        const double low = lowMass(params.*channel.bins);
        Log::log(LogLevel::Debug, "%s %f", channel.label, low);
        params.m_M_L_C_F_Hight = static_cast<float>(highMass(params.*channel.bins) / pixels() / 255);
        params.m_M_L_C_F_Low = static_cast<float>(low / pixels() / 255);
        params.*channel.low = params.m_M_L_C_F_Low;
        params.*channel.high = params.m_M_L_C_F_Hight;
    }
}
