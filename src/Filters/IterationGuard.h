#pragma once

#include "Utility/CUserParams.h"

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
