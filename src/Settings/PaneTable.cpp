#include "Settings/PaneTable.h"

namespace orvela {

namespace PaneTable {

namespace {

using P = CSliderParams;
using SliderTable::color;
using SliderTable::slider;

const PaneSlider kAdvanced[] = {
    {"sldrTemperature", slider(&P::Temperature_Enabled)},
    {"sldrGamma_Abs", slider(&P::GammaCorrectionEnabled)},
    {"sldrNoise", slider(&P::BilinearFilteringEnabled)},
    {"sldrAutoContrast", slider(&P::AutoContrast_Enabled)},
    {"sldrContrast_Abs", slider(&P::ContrastEnabled)},
    {"sldrContrast_Perc", slider(&P::Contrast2Enabled)},
    {"sldrBrightness_Abs", slider(&P::BrightnessEnabled)},
    {"sldrBrightness_Perc", slider(&P::Brightness2Enabled)},
    {"sldrIllumination", slider(&P::ClarityFilterEnabled)},
    {"sldrDigitalFlash", slider(&P::DigitalFlashEnabled)},
    {"sldrSaturation", slider(&P::SaturationEnabled)},
    {"sldrBlackAndWhiteSpots", slider(&P::SaltPepperEnabled)},
    {"sldrOrvela1", slider(&P::OrvelaLevelEnabled)},
    {"sldrOrvela2", slider(&P::OrvelaLevel2Enabled)},
    {"sldrOrvela3", slider(&P::OrvelaLevel3Enabled)},
    {"sldrShadows_Perc", slider(&P::PerceptualDarkEnabled)},
    {"sldrMiddle_Perc", slider(&P::PerceptualMiddleEnabled)},
    {"sldrHighlights_Perc", slider(&P::PerceptualLightEnabled)},
    {"sldrShadows_Abs", slider(&P::mAbsolute_Dark_Enabled)},
    {"sldrMiddle_Abs", slider(&P::mAbsolute_Middle_Enabled)},
    {"sldrHighlights_Abs", slider(&P::mAbsolute_Light_Enabled)},
    {"sldrGamma_Perc", slider(&P::PerceptualGammaEnabled)},
    {"sldrMoire", slider(&P::Moire_Enabled)},
    {"sldrAutoColor", slider(&P::mAuto_Color_Enabled)},
    {"sldrFade", slider(&P::mFade_Enabled)},
    {"sldrColorFilter", slider(&P::mColor_Effect_Intensity_Enabled)},
};

// The positions are the neutral ones.
const PaneSlider kFinalTouch[] = {
    {"sldrAbsContrast", slider(&P::mContrast_Touch_Enabled), 500},
    {"sldrPercContrast", slider(&P::mPerceptual_Contrast_Touch_Enabled)},
    {"sldrAbsBrightness", slider(&P::mBrightness_Touch_Enabled), 500},
    {"sldrPercBrightness", slider(&P::mPerceptual_Brightness_Touch_Enabled), 500},
    {"sldrPercShadowsR", slider(&P::mPerceptual_Touch_Dark_R_Enabled)},
    {"sldrPercShadowsG", slider(&P::mPerceptual_Touch_Dark_G_Enabled)},
    {"sldrPercShadowsB", slider(&P::mPerceptual_Touch_Dark_B_Enabled)},
    {"sldrPercShadowsRGB", slider(&P::mPerceptual_Touch_Dark_RGB_Enabled)},
    {"sldrPercMiddleR", slider(&P::mPerceptual_Touch_Middle_R_Enabled), 500},
    {"sldrPercMiddleG", slider(&P::mPerceptual_Touch_Middle_G_Enabled), 500},
    {"sldrPercMiddleB", slider(&P::mPerceptual_Touch_Middle_B_Enabled), 500},
    {"sldrPercMiddleRGB", slider(&P::mPerceptual_Touch_Middle_RGB_Enabled), 500},
    {"sldrPercHighlightsR", slider(&P::mPerceptual_Touch_Light_R_Enabled)},
    {"sldrPercHighlightsG", slider(&P::mPerceptual_Touch_Light_G_Enabled)},
    {"sldrPercHighlightsB", slider(&P::mPerceptual_Touch_Light_B_Enabled)},
    {"sldrPercHighlightsRGB", slider(&P::mPerceptual_Touch_Light_RGB_Enabled)},
    {"sldrAbsShadowsR", slider(&P::mDark_Touch_R_Enabled)},
    {"sldrAbsShadowsG", slider(&P::mDark_Touch_G_Enabled)},
    {"sldrAbsShadowsB", slider(&P::mDark_Touch_B_Enabled)},
    {"sldrAbsShadowsRGB", slider(&P::mDark_Touch_RGB_Enabled)},
    {"sldrAbsMiddleR", slider(&P::mMiddle_Touch_R_Enabled), 500},
    {"sldrAbsMiddleG", slider(&P::mMiddle_Touch_G_Enabled), 500},
    {"sldrAbsMiddleB", slider(&P::mMiddle_Touch_B_Enabled), 500},
    {"sldrAbsMiddleRGB", slider(&P::mMiddle_Touch_RGB_Enabled), 500},
    {"sldrAbsHighlightsR", slider(&P::mLight_Touch_R_Enabled)},
    {"sldrAbsHighlightsG", slider(&P::mLight_Touch_G_Enabled)},
    {"sldrAbsHighlightsB", slider(&P::mLight_Touch_B_Enabled)},
    {"sldrAbsHighlightsRGB", slider(&P::mLight_Touch_RGB_Enabled)},
    {"sldrAbsColorFilter", slider(&P::mColor_Touch_Enabled)},
    {"sldrPercColorFilter", slider(&P::mColor_Touch_Enabled), 0, ZoneSet::NeutralLight, true},
};

const PaneSlider kAdjustments[] = {
    {"sldr1", slider(&P::SaturationEnabled), 500},
    {"sldr2", slider(&P::PerceptualLightEnabled), 255},
    {"sldr3", slider(&P::PerceptualDarkEnabled)},
};

const PaneSlider kSmartLevels[] = {
    {"sldr1", slider(&P::PerceptualLightEnabled), 255},
    {"sldr2", slider(&P::PerceptualMiddleEnabled), 500},
    {"sldr3", slider(&P::PerceptualDarkEnabled)},
};

// In the order of the modes, from Smart Sharpness to Color Filter.
const PaneSlider kSingle[] = {
    {"sldrGeneric", slider(&P::OrvelaLevelEnabled)},
    {"sldrGeneric", slider(&P::OrvelaLevel3Enabled)},
    {"sldrGeneric", slider(&P::ClarityFilterEnabled)},
    {"sldrGeneric", slider(&P::DigitalFlashEnabled)},
    {"sldrGeneric", slider(&P::SaturationEnabled), 500},
    {"sldrGeneric", slider(&P::Contrast2Enabled)},
    {"sldrGeneric", slider(&P::Brightness2Enabled), 500},
    {"sldrGeneric", slider(&P::PerceptualGammaEnabled), 500},
    {"sldrGeneric", slider(&P::SaltPepperEnabled)},
    {"sldrGeneric", slider(&P::BilinearFilteringEnabled)},
    {"sldrGeneric", slider(&P::Moire_Enabled)},
    {"sldrGeneric", slider(&P::Temperature_Enabled), 0, ZoneSet::NeutralSingle},
    {"sldrGeneric", slider(&P::mAuto_Color_Enabled)},
    {"sldrGeneric", slider(&P::mColor_Effect_Intensity_Enabled), 0, ZoneSet::NeutralSingle},
};

const PaneColor kAdvancedColor = {"colrPickAutoColor", color(SettingStage::Main)};
const PaneColor kFinalTouchColor = {"colrPickAbsColorFilter", color(SettingStage::FinalTouch)};
const PaneColor kSingleColor = {"colrPickGeneric", color(SettingStage::Main)};

} // namespace

std::span<const PaneSlider> sliders(EGUIMode mode) {
    if (mode == Mode_Advanced)
        return kAdvanced;
    if (mode == Mode_FinalTouch)
        return kFinalTouch;
    if (const PaneSlider* slider = single(mode))
        return {slider, 1};
    return threeSliders(mode);
}

std::span<const PaneColor> colors(EGUIMode mode) {
    if (mode == Mode_Advanced)
        return {&kAdvancedColor, 1};
    if (mode == Mode_FinalTouch)
        return {&kFinalTouchColor, 1};
    if (mode == Mode_ColorFilter)
        return {&kSingleColor, 1};
    return {};
}

const PaneSlider* single(EGUIMode mode) {
    if (mode < Mode_SmartSharpness || mode > Mode_ColorFilter)
        return nullptr;
    return &kSingle[mode - Mode_SmartSharpness];
}

std::span<const PaneSlider> threeSliders(EGUIMode mode) {
    if (mode == Mode_Adjustments)
        return kAdjustments;
    if (mode == Mode_SmartLevels)
        return kSmartLevels;
    return {};
}

void startFinalTouch(CSliderParams& settings) {
    for (const PaneSlider& each : sliders(Mode_FinalTouch))
        settings.*each.slider.value = static_cast<float>(each.initial);
    for (const PaneColor& each : colors(Mode_FinalTouch))
        for (float CSliderParams::*part : each.color.parts)
            settings.*part = 255; // white, as pickers start
}

} // namespace PaneTable

} // namespace orvela
