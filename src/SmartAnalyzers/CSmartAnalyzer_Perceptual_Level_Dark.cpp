#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Level_Dark.h"

#include "Settings/Conditions.h"
#include "SmartAnalyzers/ToneMass.h"
#include "Utility/Logger.h"

using namespace orvela;

using namespace ToneMass;

namespace {

constexpr double kPull = 200; // levels by which the left end is pulled down
constexpr int kReach = 100;   // levels from the left limit to the middle of the step
constexpr double kSlope = 56;
constexpr double kMainGain = 100;
constexpr double kTouchGain = 200;

struct TouchChannel {
    bool CSliderParams::*enabled;
    Histogram CUserParams::*bins;
    float CUserParams::*coefficient;
};

constexpr TouchChannel kTouchChannels[] = {
    {&CSliderParams::mPerceptual_Touch_Dark_RGB_Enabled, &CUserParams::pHisto_Luma,
     &CUserParams::m_L_H_L_F_RGB},
    {&CSliderParams::mPerceptual_Touch_Dark_R_Enabled, &CUserParams::pHisto_Red, &CUserParams::m_L_H_L_F_R},
    {&CSliderParams::mPerceptual_Touch_Dark_G_Enabled, &CUserParams::pHisto_Green, &CUserParams::m_L_H_L_F_G},
    {&CSliderParams::mPerceptual_Touch_Dark_B_Enabled, &CUserParams::pHisto_Blue, &CUserParams::m_L_H_L_F_B},
};

double darkMass(const Histogram& bins, int center) {
    const Curve pulled = tabulate([](int i) { return i - kPull * (1 - i / 255.0); });
    return fallingMass(remap(bins, pulled), center, kSlope);
}

} // namespace

void CSmartAnalyzer_Perceptual_Level_Dark::Analyze() {
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Perceptual_Level_Dark is starting.");
    const CSliderParams& sliders = mParams->mSliderParams;
    if (!mParams->Final_Touch_Mode_Enabled) {
        if (sliders.PerceptualDarkEnabled && !sliders.mAbsolute_Dark_Enabled)
            storeMainFactors();
    } else if (LevelSwitches::touchPerceptualDark(sliders) && !LevelSwitches::touchDark(sliders)) {
        storeTouchFactors();
    }
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Perceptual_Level_Dark complete.");
}

int CSmartAnalyzer_Perceptual_Level_Dark::recountCenter() {
    measured([this] { recount(*mInPlane, *mParams); });
    const int center = leftLimit(*mParams) + kReach;
    Log::log(LogLevel::Debug, "Delta_H: %f", static_cast<double>(kReach));
    Log::log(LogLevel::Debug, "Delta_H_Low AFTER correction: %f", static_cast<double>(center));
    return center;
}

void CSmartAnalyzer_Perceptual_Level_Dark::storeMainFactors() {
    Log::log(LogLevel::Debug, "Left_Level_Coef %f", kPull);
    const int center = recountCenter();
    const double mass = darkMass(mParams->pHisto_Luma, center);
    Log::log(LogLevel::Debug, "L_L_Low %f", mass);
    if (!(mass > 0)) {
        mParams->m_L_H_L_F = 0;
        return;
    }
    const double share = mass / pixels();
    mParams->m_L_H_L_F = static_cast<float>(share * kMainGain);
    Log::log(LogLevel::Debug, "m_L_L_C_F_Low %f", share);
    Log::log(LogLevel::Debug, "m_L_H_L_F %f", static_cast<double>(mParams->m_L_H_L_F));
}

void CSmartAnalyzer_Perceptual_Level_Dark::storeTouchFactors() {
    CUserParams& params = *mParams;
    const int center = recountCenter();
    for (const TouchChannel& channel : kTouchChannels) {
        if (!(mParams->mSliderParams.*channel.enabled))
            continue;
        const double mass = darkMass(params.*channel.bins, center);
        params.*channel.coefficient = mass > 0 ? static_cast<float>(mass / pixels() * kTouchGain) : 0.0F;
    }
}
