#pragma once

#include "Utility/CUserParams.h"

/// Groups of level switches that filters and analyzers test together: any switch of the group is on.
namespace LevelSwitches {

inline bool touchDark(const CSliderParams& sliders) {
    return sliders.mDark_Touch_RGB_Enabled || sliders.mDark_Touch_R_Enabled ||
           sliders.mDark_Touch_G_Enabled || sliders.mDark_Touch_B_Enabled;
}

inline bool touchMiddle(const CSliderParams& sliders) {
    return sliders.mMiddle_Touch_RGB_Enabled || sliders.mMiddle_Touch_R_Enabled ||
           sliders.mMiddle_Touch_G_Enabled || sliders.mMiddle_Touch_B_Enabled;
}

inline bool touchLight(const CSliderParams& sliders) {
    return sliders.mLight_Touch_RGB_Enabled || sliders.mLight_Touch_R_Enabled ||
           sliders.mLight_Touch_G_Enabled || sliders.mLight_Touch_B_Enabled;
}

inline bool touchPerceptualDark(const CSliderParams& sliders) {
    return sliders.mPerceptual_Touch_Dark_RGB_Enabled || sliders.mPerceptual_Touch_Dark_R_Enabled ||
           sliders.mPerceptual_Touch_Dark_G_Enabled || sliders.mPerceptual_Touch_Dark_B_Enabled;
}

inline bool touchPerceptualMiddle(const CSliderParams& sliders) {
    return sliders.mPerceptual_Touch_Middle_RGB_Enabled || sliders.mPerceptual_Touch_Middle_R_Enabled ||
           sliders.mPerceptual_Touch_Middle_G_Enabled || sliders.mPerceptual_Touch_Middle_B_Enabled;
}

inline bool touchPerceptualLight(const CSliderParams& sliders) {
    return sliders.mPerceptual_Touch_Light_RGB_Enabled || sliders.mPerceptual_Touch_Light_R_Enabled ||
           sliders.mPerceptual_Touch_Light_G_Enabled || sliders.mPerceptual_Touch_Light_B_Enabled;
}

inline bool anyPerceptual(const CSliderParams& sliders) {
    return sliders.PerceptualDarkEnabled || sliders.PerceptualMiddleEnabled || sliders.PerceptualLightEnabled;
}

inline bool anyAbsolute(const CSliderParams& sliders) {
    return sliders.mAbsolute_Dark_Enabled || sliders.mAbsolute_Middle_Enabled ||
           sliders.mAbsolute_Light_Enabled;
}

} // namespace LevelSwitches
