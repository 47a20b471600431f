#include "Filters/CLevel_Dark_Left.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CLevel_Dark_Left::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CLevel_Dark_Left",
        .line = __LINE__,
        .opening = "Applying CLevel_Dark_Left filter from plane at 0x%x to plane at 0x%x...",
        .completion = "CLevel_Dark_Left Filter complete.",
    };
    return kDescription;
}

bool CLevel_Dark_Left::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return (sliders.mAbsolute_Dark_Enabled || LevelSwitches::touchDark(sliders)) &&
           !sliders.mAuto_Color_Enabled;
}

void CLevel_Dark_Left::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    LevelMath::Levels levels;
    if (!finalTouch && sliders.mAbsolute_Dark_Enabled)
        levels = mainLevels();
    else if (finalTouch && LevelSwitches::touchDark(sliders))
        levels = touchLevels();
    const auto weight = [mean = mParams->m_OriginalLuma](double luma) {
        return luma <= mean ? LevelMath::bell(luma, mean, LevelMath::kNarrowBell) : 1.0F;
    };
    mTables.emplace(levels, weight, LevelMath::darken);
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

void CLevel_Dark_Left::mapRow(const PixelRow& row) const {
    mTables->apply(row);
}
