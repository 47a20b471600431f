#include "Filters/CLevel_Light_Right.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CLevel_Light_Right::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CLevel_Light_Right",
        .line = __LINE__,
        .opening = "Applying CLevel_Light_Right filter from plane at 0x%x to plane at 0x%x...",
    };
    return kDescription;
}

bool CLevel_Light_Right::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool touched = LevelSwitches::touchLight(sliders);
    const bool touchedToNothing = mParams->Final_Touch_Mode_Enabled && touched &&
                                  sliders.mLight_Touch_Value_RGB == 0 && sliders.mLight_Touch_Value_R == 0 &&
                                  sliders.mLight_Touch_Value_G == 0 && sliders.mLight_Touch_Value_B == 0;
    return (sliders.mAbsolute_Light_Enabled || touched) && !sliders.mAuto_Color_Enabled && !touchedToNothing;
}

void CLevel_Light_Right::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    LevelMath::Levels levels;
    if (!finalTouch && sliders.mAbsolute_Light_Enabled)
        levels = mainLevels();
    else if (finalTouch && LevelSwitches::touchLight(sliders))
        levels = touchLevels();
    const auto weight = [mean = mParams->m_OriginalLuma](double luma) {
        return LevelMath::bell(luma, mean, LevelMath::kWideBell);
    };
    mTables.emplace(levels, weight, LevelMath::brighten);
}

LevelMath::Levels CLevel_Light_Right::mainLevels() const {
    const float position = mParams->mSliderParams.mAbsolute_Light_Value;
    return {position > 0 ? LevelMath::absoluteLevel(position) : 255.0F, {}};
}

LevelMath::Levels CLevel_Light_Right::touchLevels() const {
    const CSliderParams& sliders = mParams->mSliderParams;
    return LevelMath::replacing({LevelMath::absoluteLevel(sliders.mLight_Touch_Value_RGB),
                                 {LevelMath::absoluteLevel(sliders.mLight_Touch_Value_R),
                                  LevelMath::absoluteLevel(sliders.mLight_Touch_Value_G),
                                  LevelMath::absoluteLevel(sliders.mLight_Touch_Value_B)}});
}

void CLevel_Light_Right::mapRow(const PixelRow& row) const {
    mTables->apply(row);
}
