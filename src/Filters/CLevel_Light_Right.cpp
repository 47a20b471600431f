#include "Filters/CLevel_Light_Right.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

bool CLevel_Light_Right::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool touched = LevelSwitches::touchLight(sliders);
    if ((!sliders.mAbsolute_Light_Enabled && !touched) || sliders.mAuto_Color_Enabled)
        return false;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    if (finalTouch && touched && sliders.mLight_Touch_Value_RGB == 0 && sliders.mLight_Touch_Value_R == 0 &&
        sliders.mLight_Touch_Value_G == 0 && sliders.mLight_Touch_Value_B == 0)
        return false;
    Log::log(LogLevel::Debug, "Applying CLevel_Light_Right filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    LevelMath::Levels levels;
    if (!finalTouch && sliders.mAbsolute_Light_Enabled)
        levels = mainLevels();
    else if (finalTouch && touched)
        levels = touchLevels();
    const auto weight = [mean = mParams->m_OriginalLuma](double luma) {
        return LevelMath::bell(luma, mean, LevelMath::kWideBell);
    };
    mTables.emplace(levels, weight, LevelMath::brighten);
    return true;
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

void CLevel_Light_Right::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CLevel_Light_Right", __LINE__);
    const int y = static_cast<int>(row);
    mTables->applyRow(std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width());
}
