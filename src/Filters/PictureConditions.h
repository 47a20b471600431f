#pragma once

#include "Utility/CUserParams.h"

/// The fully automatic situation: noise filter, both illumination iterations, fade and saturation are all
/// switched on. Several filters run, or stay away, by it.
inline bool isAutomaticMode(const CSliderParams& sliders) {
    return sliders.BilinearFilteringEnabled && sliders.OrvelaLevelEnabled && sliders.OrvelaLevel2Enabled &&
           sliders.mFade_Enabled && sliders.SaturationEnabled;
}
