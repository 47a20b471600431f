#include "Filters/CLevel_Light_Right_Perceptual.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CLevel_Light_Right_Perceptual::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CLevel_Light_Right_Perceptual",
        .line = __LINE__,
        .opening = "Applying CLevel_Light_Right_Perceptual filter from plane at 0x%x to plane at 0x%x...",
    };
    return kDescription;
}

bool CLevel_Light_Right_Perceptual::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.PerceptualLightEnabled || LevelSwitches::touchPerceptualLight(sliders);
}

void CLevel_Light_Right_Perceptual::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool touched = LevelSwitches::touchPerceptualLight(sliders);
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    mTouch = finalTouch && touched;
    LevelMath::Levels levels;
    if (!finalTouch && !touched && !LevelSwitches::anyAbsolute(sliders))
        levels = mainLevels();
    else if (mTouch && !sliders.PerceptualLightEnabled && !LevelSwitches::touchLight(sliders) &&
             mParams->Normal_Picture)
        levels = touchLevels();
    mTables.emplace(
        levels, [this](double luma) { return weight(luma); }, LevelMath::brighten);
}

LevelMath::Levels CLevel_Light_Right_Perceptual::mainLevels() const {
    return {LevelMath::perceptualLevel(mParams->m_R_L_L_F, mParams->mSliderParams.PerceptualLight), {}};
}

LevelMath::Levels CLevel_Light_Right_Perceptual::touchLevels() const {
    const CSliderParams& sliders = mParams->mSliderParams;
    using LevelMath::perceptualLevel;
    return {perceptualLevel(mParams->m_R_L_L_F, sliders.mPerceptual_Touch_Light_Value_RGB),
            {perceptualLevel(mParams->m_R_L_L_F_R, sliders.mPerceptual_Touch_Light_Value_R),
             perceptualLevel(mParams->m_R_L_L_F_G, sliders.mPerceptual_Touch_Light_Value_G),
             perceptualLevel(mParams->m_R_L_L_F_B, sliders.mPerceptual_Touch_Light_Value_B)}};
}

float CLevel_Light_Right_Perceptual::weight(double luma) const {
    const float mean = mParams->m_OriginalLuma;
    if (mTouch)
        return LevelMath::bell(luma, mean, LevelMath::kWideBell);
    const float position = mParams->mSliderParams.PerceptualLight;
    if (luma >= mean && position < 900)
        return LevelMath::bell(luma, mean, LevelMath::kPerceptualBell);
    return LevelMath::topRangeWeight(position);
}

void CLevel_Light_Right_Perceptual::mapRow(const PixelRow& row) const {
    mTables->apply(row);
}
