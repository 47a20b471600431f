#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Level_Right.h"

#include "Settings/Conditions.h"
#include "SmartAnalyzers/ToneMass.h"
#include "Utility/Logger.h"

#include <algorithm>

using namespace orvela;

using namespace ToneMass;

namespace {

constexpr double kStretch = 200; // levels by which the right end is pushed up
constexpr int kReach = 100;      // levels from the right limit to the middle of the step
constexpr double kSlope = 56;
constexpr double kLumaGain = 150;
constexpr double kColorGain = 200;

struct TouchChannel {
    bool CSliderParams::*enabled;
    Histogram CUserParams::*bins;
    float CUserParams::*coefficient;
    double gain;
};

constexpr TouchChannel kTouchChannels[] = {
    {&CSliderParams::mPerceptual_Touch_Light_RGB_Enabled, &CUserParams::pHisto_Luma, &CUserParams::m_R_L_L_F,
     kLumaGain},
    {&CSliderParams::mPerceptual_Touch_Light_R_Enabled, &CUserParams::pHisto_Red, &CUserParams::m_R_L_L_F_R,
     kColorGain},
    {&CSliderParams::mPerceptual_Touch_Light_G_Enabled, &CUserParams::pHisto_Green, &CUserParams::m_R_L_L_F_G,
     kColorGain},
    {&CSliderParams::mPerceptual_Touch_Light_B_Enabled, &CUserParams::pHisto_Blue, &CUserParams::m_R_L_L_F_B,
     kColorGain},
};

// Share of the tones that the stretch leaves short of the right end.
double shortShare(const Histogram& bins, int center, int pixels) {
    const Curve stretched = tabulate([](int i) { return std::min(255.0, i + kStretch * i / 255); });
    return 1 - risingMass(remap(bins, stretched), center, kSlope) / pixels;
}

} // namespace

void CSmartAnalyzer_Perceptual_Level_Right::Analyze() {
    const CSliderParams& sliders = mParams->mSliderParams;
    if (LevelSwitches::anyPerceptual(sliders) && !LevelSwitches::anyAbsolute(sliders))
        storeMainFactors();
    if (LevelSwitches::touchPerceptualLight(sliders) && !LevelSwitches::touchLight(sliders))
        storeTouchFactors();
}

int CSmartAnalyzer_Perceptual_Level_Right::recountLimit() {
    measured([this] { recount(*mInPlane, *mParams); });
    const int limit = rightLimit(*mParams);
    Log::log(LogLevel::Debug, "Delta_H: %f", static_cast<double>(kReach));
    Log::log(LogLevel::Debug, "Delta_H AFTER correction: %f", static_cast<double>(limit + kReach));
    return limit;
}

void CSmartAnalyzer_Perceptual_Level_Right::storeMainFactors() {
    Log::log(LogLevel::Debug, "HIGHLIGHT HAS STARTED");
    const int limit = recountLimit();
    const double share = shortShare(mParams->pHisto_Luma, limit + kReach, pixels());
    mParams->m_R_L_L_F = static_cast<float>(share * kLumaGain + limit);
    Log::log(LogLevel::Debug, "(1.0f- m_R_L_C_F_Loc): %f", share);
    Log::log(LogLevel::Debug, "Perceptual Right level: %f", static_cast<double>(mParams->m_R_L_L_F));
}

void CSmartAnalyzer_Perceptual_Level_Right::storeTouchFactors() {
    CUserParams& params = *mParams;
    const int center = recountLimit() + kReach;
    for (const TouchChannel& channel : kTouchChannels) {
        if (!(mParams->mSliderParams.*channel.enabled))
            continue;
        const double share = shortShare(params.*channel.bins, center, pixels());
        params.*channel.coefficient = static_cast<float>(share * channel.gain);
    }
}
