#include "Filters/CLevel_Dark_Left_Perceptual.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CLevel_Dark_Left_Perceptual::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CLevel_Dark_Left_Perceptual",
        .line = __LINE__,
        .opening = "Applying CLevel_Dark_Left_Perceptual filter from plane at 0x%x to plane at 0x%x...",
        .completion = "CLevel_Dark_Left_Perceptual Filter complete.",
    };
    return kDescription;
}

bool CLevel_Dark_Left_Perceptual::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool absolute = sliders.mAbsolute_Dark_Enabled || LevelSwitches::touchDark(sliders);
    return (sliders.PerceptualDarkEnabled || LevelSwitches::touchPerceptualDark(sliders)) && !absolute;
}

void CLevel_Dark_Left_Perceptual::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool touched = LevelSwitches::touchPerceptualDark(sliders);
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled 000 %d.", !finalTouch);
    mTouch = finalTouch && touched;
    LevelMath::Levels levels;
    if (mTouch) {
        useHostPicture();
        levels = touchLevels();
    } else if (!finalTouch && sliders.PerceptualDarkEnabled) {
        levels = mainLevels();
    }
    mTables.emplace(
        levels, [this](double luma) { return weight(luma); }, LevelMath::darken);
    Log::log(LogLevel::Debug, "Final_Touch_Mode_Enabled %d", finalTouch);
    Log::log(LogLevel::Debug, "Perceptual_Touch_Tone_Dark_Enabled  %d", touched);
    Log::log(LogLevel::Debug, " Normal_Picture%d", mParams->Normal_Picture);
    Log::log(LogLevel::Debug, " !Touch_Tone_Dark_Enabled %d", !LevelSwitches::touchDark(sliders));
    mVertEnd = static_cast<std::uint32_t>(mInPlane->height() - 1);
}

LevelMath::Levels CLevel_Dark_Left_Perceptual::mainLevels() const {
    Log::log(LogLevel::Debug, "CLevel_Dark_Left_Perceptual 1st Condition matched.");
    return {LevelMath::perceptualLevel(mParams->m_L_H_L_F, mParams->mSliderParams.PerceptualDark), {}};
}

LevelMath::Levels CLevel_Dark_Left_Perceptual::touchLevels() const {
    const CSliderParams& sliders = mParams->mSliderParams;
    using LevelMath::perceptualLevel;
    return {perceptualLevel(mParams->m_L_H_L_F_RGB, sliders.mPerceptual_Touch_Dark_Value_RGB),
            {perceptualLevel(mParams->m_L_H_L_F_R, sliders.mPerceptual_Touch_Dark_Value_R, 0.8),
             perceptualLevel(mParams->m_L_H_L_F_G, sliders.mPerceptual_Touch_Dark_Value_G, 0.6),
             perceptualLevel(mParams->m_L_H_L_F_B, sliders.mPerceptual_Touch_Dark_Value_B, 0.6)}};
}

float CLevel_Dark_Left_Perceptual::weight(double luma) const {
    const float position = mTouch ? 0 : mParams->mSliderParams.PerceptualDark;
    if (luma <= mParams->m_OriginalLuma && position < 900)
        return LevelMath::bell(luma, mParams->m_OriginalLuma, LevelMath::kPerceptualBell);
    return LevelMath::topRangeWeight(position);
}

// The moved value was truncated, which does not change the truncated average with a whole number.
void CLevel_Dark_Left_Perceptual::averageWithHost(const PixelRow& row) const {
    const ConstRow host = hostRow(row.y);
    for (std::size_t c = 0; c < 3; ++c) {
        for (int x = 0; x < row.width; ++x)
            row.out[c][x] = static_cast<std::uint8_t>((row.out[c][x] + host[c][x]) / 2);
    }
}

void CLevel_Dark_Left_Perceptual::mapRow(const PixelRow& row) const {
    mTables->apply(row);
    if (mTouch)
        averageWithHost(row);
}
