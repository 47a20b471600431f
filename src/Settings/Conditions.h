#pragma once

#include "Settings/CUserParams.h"

namespace orvela {

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

/// The fully automatic situation: noise filter, both illumination iterations, fade and saturation are all
/// switched on. Several filters run, or stay away, by it.
inline bool isAutomaticMode(const CSliderParams& sliders) {
    return sliders.BilinearFilteringEnabled && sliders.OrvelaLevelEnabled && sliders.OrvelaLevel2Enabled &&
           sliders.mFade_Enabled && sliders.SaturationEnabled;
}

/// True when a picture has too much or too little colour detail for an illumination iteration: smoothing is
/// on, one of the corrections that decide for themselves (all three perceptual levels, automatic colour or
/// automatic contrast) is on, and the mean colour gradient lies above 2.18 or below `lowerBound` (both
/// strict).
inline bool isTooSharpFor(const CUserParams& params, double lowerBound) {
    const CSliderParams& sliders = params.mSliderParams;
    const bool allPerceptual =
        sliders.PerceptualLightEnabled && sliders.PerceptualMiddleEnabled && sliders.PerceptualDarkEnabled;
    const bool automatic = allPerceptual || sliders.mAuto_Color_Enabled || sliders.AutoContrast_Enabled;
    const bool outside = params.mSum_Color > 2.18 || params.mSum_Color < lowerBound;
    return sliders.OrvelaLevel3Enabled && outside && automatic;
}

} // namespace orvela
