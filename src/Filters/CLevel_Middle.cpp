#include "Filters/CLevel_Middle.h"

#include "Filters/Curves/GammaCurve.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CLevel_Middle::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CLevel_Middle",
        .line = __LINE__,
        .opening = "Applying CLevel_Middle filter from plane at 0x%x to plane at 0x%x...",
    };
    return kDescription;
}

bool CLevel_Middle::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return (sliders.mAbsolute_Middle_Enabled || LevelSwitches::touchMiddle(sliders)) &&
           !sliders.mAuto_Color_Enabled;
}

void CLevel_Middle::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !finalTouch);
    mMaps = LevelMath::factorMaps(1, {1, 1, 1});
    if (!finalTouch && sliders.mAbsolute_Middle_Enabled && sliders.mAbsolute_Middle_Value != 500)
        prepareMain();
    else if (finalTouch && LevelSwitches::touchMiddle(sliders))
        prepareTouch();
}

void CLevel_Middle::prepareMain() {
    const float position = mParams->mSliderParams.mAbsolute_Middle_Value;
    Log::log(LogLevel::Debug, "Middle_Level_Value  %f", static_cast<double>(position));
    Log::log(LogLevel::Debug, "CLevel_Middle Condition matched.");
    const float gamma = LevelMath::sliderToGamma(position);
    mMaps = LevelMath::factorMaps(LevelMath::gammaRatio(mParams->m_OriginalLuma, gamma), {1, 1, 1});
}

void CLevel_Middle::prepareTouch() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const auto ratio = [](float mean, float position) {
        return LevelMath::gammaRatio(mean, LevelMath::sliderToGamma(position));
    };
    const float mean = mParams->m_OriginalLuma;
    const float common = ratio(mean, sliders.mMiddle_Touch_Value_RGB);
    const std::array<float, 3> own = {ratio(mParams->m_OriginalLumaR, sliders.mMiddle_Touch_Value_R),
                                      ratio(mParams->m_OriginalLumaG, sliders.mMiddle_Touch_Value_G),
                                      ratio(mParams->m_OriginalLumaB, sliders.mMiddle_Touch_Value_B)};
    mMaps = LevelMath::factorMaps(common, own);

    const float gamma = LevelMath::sliderToGamma(sliders.mMiddle_Touch_Value_RGB);
    const float moved = GammaCurve::transfer(PixelMath::trunc(mean), gamma);
    Log::log(LogLevel::Debug, "CLevel_Middle TOUCH Condition matched.");
    Log::log(LogLevel::Debug, "Luma_GAMMA_Factor %f", static_cast<double>(gamma));
    Log::log(LogLevel::Debug, "Ori_aux %f", static_cast<double>(moved));
    Log::log(LogLevel::Debug, "Gamma_Radio_RGB %f", static_cast<double>(common));
    Log::log(LogLevel::Debug, "Gamma_Radio_R %f", static_cast<double>(own[0]));
    Log::log(LogLevel::Debug, "Gamma_Radio_G %f", static_cast<double>(own[1]));
    Log::log(LogLevel::Debug, "Gamma_Radio_B %f", static_cast<double>(own[2]));
}

void CLevel_Middle::mapRow(const PixelRow& row) const {
    mapKeepingHue(mMaps, row);
}
