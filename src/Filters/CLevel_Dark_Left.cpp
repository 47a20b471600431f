#include "Filters/CLevel_Dark_Left.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

bool CLevel_Dark_Left::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool touched = LevelSwitches::touchDark(sliders);
    if ((!sliders.mAbsolute_Dark_Enabled && !touched) || sliders.mAuto_Color_Enabled)
        return false;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "Applying CLevel_Dark_Left filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    LevelMath::Levels levels;
    if (!finalTouch && sliders.mAbsolute_Dark_Enabled)
        levels = mainLevels();
    else if (finalTouch && touched)
        levels = touchLevels();
    const auto weight = [mean = mParams->m_OriginalLuma](double luma) {
        return luma <= mean ? LevelMath::bell(luma, mean, LevelMath::kNarrowBell) : 1.0F;
    };
    mTables.emplace(levels, weight, LevelMath::darken);
    return true;
}

LevelMath::Levels CLevel_Dark_Left::mainLevels() const {
    Log::log(LogLevel::Debug, "CLevel_Dark_Left Condition matched.");
    return {std::max(0.0F, LevelMath::absoluteLevel(mParams->mSliderParams.mAbsolute_Dark_Value)), {}};
}

LevelMath::Levels CLevel_Dark_Left::touchLevels() const {
    const CSliderParams& sliders = mParams->mSliderParams;
    return LevelMath::replacing({LevelMath::absoluteLevel(sliders.mDark_Touch_Value_RGB),
                                 {LevelMath::absoluteLevel(sliders.mDark_Touch_Value_R),
                                  LevelMath::absoluteLevel(sliders.mDark_Touch_Value_G),
                                  LevelMath::absoluteLevel(sliders.mDark_Touch_Value_B)}});
}

void CLevel_Dark_Left::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CLevel_Dark_Left", __LINE__);
    const int y = static_cast<int>(row);
    mTables->applyRow(std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width());
}

bool CLevel_Dark_Left::PostApply() {
    Log::log(LogLevel::Debug, "CLevel_Dark_Left Filter complete.");
    return true;
}
