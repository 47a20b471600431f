#include "Filters/CLevel_Middle_Perceptual.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <limits>

using namespace orvela;

namespace {

// One of the four midtone sliders of the final-touch pane with its coefficients.
struct Tone {
    const char* slider;      // as the log names it
    const char* coefficient; // its ending in the names of the coefficients
    bool CSliderParams::*enabled;
    float CSliderParams::*position;
    float CUserParams::*high;
    float CUserParams::*low;
    double reach;
};

constexpr std::array<Tone, 4> kTones = {{
    {"RGB", "", &CSliderParams::mPerceptual_Touch_Middle_RGB_Enabled,
     &CSliderParams::mPerceptual_Touch_Middle_Value_RGB, &CUserParams::m_M_H_H_F, &CUserParams::m_M_H_L_F,
     2.5},
    {"R", "_R", &CSliderParams::mPerceptual_Touch_Middle_R_Enabled,
     &CSliderParams::mPerceptual_Touch_Middle_Value_R, &CUserParams::m_M_H_H_F_R, &CUserParams::m_M_H_L_F_R,
     1.5},
    {"G", "_G", &CSliderParams::mPerceptual_Touch_Middle_G_Enabled,
     &CSliderParams::mPerceptual_Touch_Middle_Value_G, &CUserParams::m_M_H_H_F_G, &CUserParams::m_M_H_L_F_G,
     1.7},
    {"B", "_B", &CSliderParams::mPerceptual_Touch_Middle_B_Enabled,
     &CSliderParams::mPerceptual_Touch_Middle_Value_B, &CUserParams::m_M_H_H_F_B, &CUserParams::m_M_H_L_F_B,
     2.0},
}};

// Uses a part of the coefficient up.
double decreased(float& high) {
    if (high > 1)
        high -= 1;
    return high;
}

float takeTouchGamma(CUserParams& params, const Tone& tone) {
    if (!(params.mSliderParams.*tone.enabled))
        return 1;
    const double position = params.mSliderParams.*tone.position;
    if (position < 500)
        return static_cast<float>((1 - position / 500) * params.*tone.low);
    return static_cast<float>((position - 500) / 500 * decreased(params.*tone.high) * tone.reach + 1);
}

// How far the ratio of one channel may stray from the balance of the channel means.
struct Bounds {
    float most;
    float least; // for sliders below 100 only
};

// A mean of 0 bounds nothing.
Bounds ratioBounds(const CUserParams& params) {
    const auto [smallest, largest] =
        std::minmax({params.m_OriginalLumaR, params.m_OriginalLumaG, params.m_OriginalLumaB});
    if (smallest <= 0)
        return {std::numeric_limits<float>::infinity(), 0};
    const double imbalance = static_cast<double>(largest) / smallest * (smallest > 100 ? 1.5 : 1.0);
    const auto most = static_cast<float>(imbalance);
    const auto least = static_cast<float>(1.3 / most * (smallest > 80 ? 1.1 : 1.0));
    return {most, least > 1 ? 1 / most : least};
}

float bounded(float ratio, float position, const Bounds& bounds) {
    const float limited = std::min(ratio, bounds.most);
    return position < 100 ? std::max(limited, bounds.least) : limited;
}

// A ratio below 1 acts as its distance to 1.
float factor(float ratio) {
    return ratio < 1 ? 1 - ratio : ratio;
}

void logTones(const CUserParams& params) {
    Log::log(LogLevel::Debug, "CLevel_Middle_Perceptual FINAL TOUCH 1st Condition matched.");
    for (const Tone& tone : kTones) {
        Log::log(LogLevel::Debug, "Perceptual_Touch_Middle_Value_%s %d. m_M_H_H_F%s %f ; m_M_H_L_F%s %f",
                 tone.slider, static_cast<int>(params.mSliderParams.*tone.position), tone.coefficient,
                 static_cast<double>(params.*tone.high), tone.coefficient,
                 static_cast<double>(params.*tone.low));
    }
}

} // namespace

const TaskDescription& CLevel_Middle_Perceptual::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CLevel_Middle_Perceptual",
        .line = __LINE__,
        .opening = "Applying CLevel_Middle_Perceptual filter from plane at 0x%x to plane at 0x%x...",
    };
    return kDescription;
}

bool CLevel_Middle_Perceptual::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.PerceptualMiddleEnabled || LevelSwitches::touchPerceptualMiddle(sliders);
}

void CLevel_Middle_Perceptual::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    mMaps = LevelMath::factorMaps(1, {1, 1, 1});
    if (!finalTouch && sliders.PerceptualMiddleEnabled && !sliders.mAbsolute_Middle_Enabled)
        mMaps = LevelMath::gammaMaps(takeMainGamma());
    else if (finalTouch && LevelSwitches::touchPerceptualMiddle(sliders) &&
             !LevelSwitches::touchMiddle(sliders) && mParams->Normal_Picture)
        takeTouchMaps();
}

float CLevel_Middle_Perceptual::takeMainGamma() {
    const CSliderParams& sliders = mParams->mSliderParams;
    if (sliders.PerceptualGammaEnabled || !mParams->Normal_Picture || LevelSwitches::anyAbsolute(sliders))
        return 1;
    const double position = sliders.PerceptualMiddle;
    if (position >= 500)
        return static_cast<float>((position - 500) / 500 * decreased(mParams->m_M_H_H_F) * 9 + 1);
    const double low = mParams->m_M_H_L_F;
    return static_cast<float>(position / 500 * (1 - low) + low);
}

void CLevel_Middle_Perceptual::takeTouchMaps() {
    logTones(*mParams);
    std::array<float, 4> gammas;
    for (std::size_t i = 0; i < kTones.size(); ++i)
        gammas[i] = takeTouchGamma(*mParams, kTones[i]);
    Log::log(LogLevel::Debug, "CLevel_Middle_Perceptual TOUCH 2nd Condition matched.");

    const Bounds bounds = ratioBounds(*mParams);
    const std::array<float, 4> means = {mParams->m_OriginalLuma, mParams->m_OriginalLumaR,
                                        mParams->m_OriginalLumaG, mParams->m_OriginalLumaB};
    std::array<float, 4> factors;
    for (std::size_t i = 0; i < kTones.size(); ++i) {
        float ratio = LevelMath::gammaRatio(means[i], gammas[i]);
        if (i > 0)
            ratio = bounded(ratio, mParams->mSliderParams.*kTones[i].position, bounds);
        Log::log(LogLevel::Debug, "Shadow_Radio_%s %f.", kTones[i].slider, static_cast<double>(ratio));
        factors[i] = factor(ratio);
    }
    mMaps = LevelMath::factorMaps(factors[0], {factors[1], factors[2], factors[3]});
}

void CLevel_Middle_Perceptual::mapRow(const PixelRow& row) const {
    mapKeepingHue(mMaps, row);
}
