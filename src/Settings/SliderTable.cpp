#include "Settings/SliderTable.h"

namespace orvela {

namespace SliderTable {

namespace {

using P = CSliderParams;
using G = SliderGroup;
using namespace SliderScales;

constexpr SliderDescription kAdvanced[] = {
    {"sldrTemperature", "Temperature", G::Color, &Temperature, 2000, 10000, &P::Temperature_Value,
     &P::Temperature_Enabled, 4, 0},
    {"sldrGamma_Abs", "Gamma", G::Absolute, &Gamma, 0.1, 10, &P::GammaCorrectionValue,
     &P::GammaCorrectionEnabled, 4, 0},
    {"sldrNoise", "Noise", G::Artefacts, &Noise, 0.5, 5, &P::BilinearFilteringValue,
     &P::BilinearFilteringEnabled, 1, 0},
    {"sldrAutoContrast", "AutoContrast", G::Global, &Tenth, 0, 100, nullptr, &P::AutoContrast_Enabled, 1, 0},
    {"sldrContrast_Abs", "Contrast", G::Absolute, &Contrast, -100, 100, &P::ContrastValue,
     &P::ContrastEnabled, 4, 0},
    {"sldrContrast_Perc", "Contrast", G::Perceptual, &Tenth, 0, 100, &P::Contrast2Value, &P::Contrast2Enabled,
     1, 0},
    {"sldrBrightness_Abs", "Brightness", G::Absolute, &Brightness, -255, 255, &P::BrightnessValue,
     &P::BrightnessEnabled, 4, 0},
    {"sldrBrightness_Perc", "Brightness", G::Perceptual, &Brightness, -255, 255, &P::Brightness2Value,
     &P::Brightness2Enabled, 2, 0},
    {"sldrIllumination", "Illumination", G::Lighting, &Hundredth, 0, 10, &P::ClarityFilterValue,
     &P::ClarityFilterEnabled, 7, 0},
    {"sldrDigitalFlash", "Digital Flash", G::Lighting, &Tenth, 0, 100, &P::mDigital_Flash_Value,
     &P::DigitalFlashEnabled, 8, 0},
    {"sldrSaturation", "Saturation", G::Lighting, &Hundredth, 0, 10, &P::SaturationValue,
     &P::SaturationEnabled, 8, 0},
    {"sldrBlackAndWhiteSpots", "B&W Spots", G::Artefacts, &Spots, 0.5, 100, &P::SaltPepperValue,
     &P::SaltPepperEnabled, 1, 0},
    {"sldrOrvela1", "Sharpness I", G::Texture, &Sharpness, 30, 71, &P::OrvelaLevelValue,
     &P::OrvelaLevelEnabled, 6, 0},
    {"sldrOrvela2", "Sharpness II", G::Texture, &Sharpness, 30, 71, &P::OrvelaLevel2Value,
     &P::OrvelaLevel2Enabled, 6, 0},
    {"sldrOrvela3", "Smart Blur", G::Texture, &Thousandth, 0, 1, &P::OrvelaLevel3Value,
     &P::OrvelaLevel3Enabled, 9, 0},
    {"sldrShadows_Perc", "Dark", G::Perceptual, &Shadows, 0, 255, &P::PerceptualDark,
     &P::PerceptualDarkEnabled, 1, 0},
    {"sldrMiddle_Perc", "Middle", G::Perceptual, &Gamma, 0.1, 10, &P::PerceptualMiddle,
     &P::PerceptualMiddleEnabled, 12, 0},
    {"sldrHighlights_Perc", "Highlights", G::Perceptual, &Highlights, 255, 0, &P::PerceptualLight,
     &P::PerceptualLightEnabled, 1, 0},
    {"sldrShadows_Abs", "Dark", G::Absolute, &Shadows, 0, 255, &P::mAbsolute_Dark_Value,
     &P::mAbsolute_Dark_Enabled, 4, 0},
    {"sldrMiddle_Abs", "Middle", G::Absolute, &Gamma, 0.1, 10, &P::mAbsolute_Middle_Value,
     &P::mAbsolute_Middle_Enabled, 4, 0},
    {"sldrHighlights_Abs", "Highlights", G::Absolute, &Highlights, 255, 0, &P::mAbsolute_Light_Value,
     &P::mAbsolute_Light_Enabled, 4, 0},
    {"sldrGamma_Perc", "Gamma", G::Perceptual, &Gamma, 0.1, 10, &P::PerceptualGamma,
     &P::PerceptualGammaEnabled, 12, 0},
    {"sldrMoire", "Moire", G::Artefacts, &Moire, 0.1, 10, &P::mMoire_Value, &P::Moire_Enabled, 1, 0},
    {"sldrAutoColor", "AutoColor", G::Color, &Tenth, 0, 100, &P::mAuto_Color_Value, &P::mAuto_Color_Enabled,
     1, 0},
    {"sldrFade", "Fade", G::Global, &Tenth, 0, 100, &P::mFade_Value, &P::mFade_Enabled, 10, 0},
    {"sldrColorFilter", "Color Filter", G::Color, &Tenth, 0, 100, &P::mColor_Effect_Intensity_Value,
     &P::mColor_Effect_Intensity_Enabled, 4, 0},
};

// A level slider of the Final Touch pane for one tone of one channel.
constexpr SliderDescription shadows(const char* object, float P::*value, bool P::*enabled, int zones) {
    return {object, "Shadows", G::Levels, &Shadows, 0, 255, value, enabled, zones, 0};
}
constexpr SliderDescription middle(const char* object, float P::*value, bool P::*enabled, int zones) {
    return {object, "Middle", G::Levels, &Gamma, 0.1, 10, value, enabled, zones, 500};
}
constexpr SliderDescription highlights(const char* object, float P::*value, bool P::*enabled, int zones) {
    return {object, "Highlights", G::Levels, &Highlights, 255, 0, value, enabled, zones, 0};
}

constexpr SliderDescription kFinalTouch[] = {
    {"sldrAbsContrast", "Contrast", G::LightAndColor, &Contrast, -100, 100, &P::mContrast_Touch_Value,
     &P::mContrast_Touch_Enabled, 4, 500},
    {"sldrPercContrast", "Contrast", G::LightAndColor, &Tenth, 0, 100, &P::mPerceptual_Contrast_Touch_Value,
     &P::mPerceptual_Contrast_Touch_Enabled, 1, 0},
    {"sldrAbsBrightness", "Brightness", G::LightAndColor, &Brightness, -255, 255, &P::mBrightness_Touch_Value,
     &P::mBrightness_Touch_Enabled, 4, 500},
    {"sldrPercBrightness", "Brightness", G::LightAndColor, &Brightness, -255, 255,
     &P::mPerceptual_Brightness_Touch_Value, &P::mPerceptual_Brightness_Touch_Enabled, 5, 500},
    shadows("sldrPercShadowsR", &P::mPerceptual_Touch_Dark_Value_R, &P::mPerceptual_Touch_Dark_R_Enabled, 1),
    shadows("sldrPercShadowsG", &P::mPerceptual_Touch_Dark_Value_G, &P::mPerceptual_Touch_Dark_G_Enabled, 1),
    shadows("sldrPercShadowsB", &P::mPerceptual_Touch_Dark_Value_B, &P::mPerceptual_Touch_Dark_B_Enabled, 1),
    shadows("sldrPercShadowsRGB", &P::mPerceptual_Touch_Dark_Value_RGB,
            &P::mPerceptual_Touch_Dark_RGB_Enabled, 1),
    middle("sldrPercMiddleR", &P::mPerceptual_Touch_Middle_Value_R, &P::mPerceptual_Touch_Middle_R_Enabled,
           5),
    middle("sldrPercMiddleG", &P::mPerceptual_Touch_Middle_Value_G, &P::mPerceptual_Touch_Middle_G_Enabled,
           5),
    middle("sldrPercMiddleB", &P::mPerceptual_Touch_Middle_Value_B, &P::mPerceptual_Touch_Middle_B_Enabled,
           5),
    middle("sldrPercMiddleRGB", &P::mPerceptual_Touch_Middle_Value_RGB,
           &P::mPerceptual_Touch_Middle_RGB_Enabled, 13),
    highlights("sldrPercHighlightsR", &P::mPerceptual_Touch_Light_Value_R,
               &P::mPerceptual_Touch_Light_R_Enabled, 1),
    highlights("sldrPercHighlightsG", &P::mPerceptual_Touch_Light_Value_G,
               &P::mPerceptual_Touch_Light_G_Enabled, 1),
    highlights("sldrPercHighlightsB", &P::mPerceptual_Touch_Light_Value_B,
               &P::mPerceptual_Touch_Light_B_Enabled, 1),
    highlights("sldrPercHighlightsRGB", &P::mPerceptual_Touch_Light_Value_RGB,
               &P::mPerceptual_Touch_Light_RGB_Enabled, 1),
    shadows("sldrAbsShadowsR", &P::mDark_Touch_Value_R, &P::mDark_Touch_R_Enabled, 3),
    shadows("sldrAbsShadowsG", &P::mDark_Touch_Value_G, &P::mDark_Touch_G_Enabled, 3),
    shadows("sldrAbsShadowsB", &P::mDark_Touch_Value_B, &P::mDark_Touch_B_Enabled, 3),
    shadows("sldrAbsShadowsRGB", &P::mDark_Touch_Value_RGB, &P::mDark_Touch_RGB_Enabled, 3),
    middle("sldrAbsMiddleR", &P::mMiddle_Touch_Value_R, &P::mMiddle_Touch_R_Enabled, 3),
    middle("sldrAbsMiddleG", &P::mMiddle_Touch_Value_G, &P::mMiddle_Touch_G_Enabled, 3),
    middle("sldrAbsMiddleB", &P::mMiddle_Touch_Value_B, &P::mMiddle_Touch_B_Enabled, 3),
    middle("sldrAbsMiddleRGB", &P::mMiddle_Touch_Value_RGB, &P::mMiddle_Touch_RGB_Enabled, 3),
    highlights("sldrAbsHighlightsR", &P::mLight_Touch_Value_R, &P::mLight_Touch_R_Enabled, 4),
    highlights("sldrAbsHighlightsG", &P::mLight_Touch_Value_G, &P::mLight_Touch_G_Enabled, 4),
    highlights("sldrAbsHighlightsB", &P::mLight_Touch_Value_B, &P::mLight_Touch_B_Enabled, 4),
    highlights("sldrAbsHighlightsRGB", &P::mLight_Touch_Value_RGB, &P::mLight_Touch_RGB_Enabled, 3),
    {"sldrAbsColorFilter", "Color Filter", G::LightAndColor, &Tenth, 0, 100, &P::mColor_Intensity_Touch_Value,
     &P::mColor_Touch_Enabled, 4, 0},
    {"sldrPercColorFilter", "Color Filter", G::LightAndColor, &Tenth, 0, 100, nullptr, nullptr, 3, 0},
};

constexpr SliderDescription kAdjustments[] = {
    {"sldr1", "Saturation", G::Single, &Hundredth, 0, 10, &P::SaturationValue, &P::SaturationEnabled, 8, 500},
    {"sldr2", "Highlights", G::Single, &Highlights, 255, 0, &P::PerceptualLight, &P::PerceptualLightEnabled,
     1, 255},
    {"sldr3", "Dark", G::Single, &Shadows, 0, 255, &P::PerceptualDark, &P::PerceptualDarkEnabled, 1, 0},
};

constexpr SliderDescription kSmartLevels[] = {
    {"sldr1", "Highlights", G::Single, &Highlights, 255, 0, &P::PerceptualLight, &P::PerceptualLightEnabled,
     1, 255},
    {"sldr2", "Middle", G::Single, &Gamma, 0.1, 10, &P::PerceptualMiddle, &P::PerceptualMiddleEnabled, 12,
     500},
    {"sldr3", "Dark", G::Single, &Shadows, 0, 255, &P::PerceptualDark, &P::PerceptualDarkEnabled, 1, 0},
};

// In the order of the modes, from Smart Sharpness to Color Filter.
constexpr SliderDescription kSingle[] = {
    {"sldrGeneric", "Sharpness I", G::Single, &Sharpness, 30, 71, &P::OrvelaLevelValue,
     &P::OrvelaLevelEnabled, 6, 0},
    {"sldrGeneric", "Smart Blur", G::Single, &Thousandth, 0, 1, &P::OrvelaLevel3Value,
     &P::OrvelaLevel3Enabled, 9, 0},
    {"sldrGeneric", "Illumination", G::Single, &Hundredth, 0, 10, &P::ClarityFilterValue,
     &P::ClarityFilterEnabled, 7, 0},
    {"sldrGeneric", "Digital Flash", G::Single, &Tenth, 0, 100, &P::mDigital_Flash_Value,
     &P::DigitalFlashEnabled, 8, 0},
    {"sldrGeneric", "Saturation", G::Single, &Hundredth, 0, 10, &P::SaturationValue, &P::SaturationEnabled, 8,
     500},
    {"sldrGeneric", "Contrast", G::Single, &Tenth, 0, 100, &P::Contrast2Value, &P::Contrast2Enabled, 1, 0},
    {"sldrGeneric", "Brightness", G::Single, &Brightness, -255, 255, &P::Brightness2Value,
     &P::Brightness2Enabled, 2, 500},
    {"sldrGeneric", "Gamma", G::Single, &Gamma, 0.1, 10, &P::PerceptualGamma, &P::PerceptualGammaEnabled, 12,
     500},
    {"sldrGeneric", "B&W Spots", G::Single, &Spots, 0.5, 100, &P::SaltPepperValue, &P::SaltPepperEnabled, 1,
     0},
    {"sldrGeneric", "Noise", G::Single, &Noise, 0.5, 5, &P::BilinearFilteringValue,
     &P::BilinearFilteringEnabled, 1, 0},
    {"sldrGeneric", "Moire", G::Single, &Moire, 0.1, 10, &P::mMoire_Value, &P::Moire_Enabled, 1, 0},
    {"sldrGeneric", "Temperature", G::Single, &Temperature, 2000, 10000, &P::Temperature_Value,
     &P::Temperature_Enabled, 11, 0},
    {"sldrGeneric", "AutoColor", G::Single, &Tenth, 0, 100, &P::mAuto_Color_Value, &P::mAuto_Color_Enabled, 1,
     0},
    {"sldrGeneric", "Color Filter", G::Single, &Tenth, 0, 100, &P::mColor_Effect_Intensity_Value,
     &P::mColor_Effect_Intensity_Enabled, 11, 0},
};

} // namespace

std::span<const SliderDescription> advanced() {
    return kAdvanced;
}

std::span<const SliderDescription> finalTouch() {
    return kFinalTouch;
}

std::span<const SliderDescription> threeSliders(EGUIMode mode) {
    if (mode == Mode_Adjustments)
        return kAdjustments;
    if (mode == Mode_SmartLevels)
        return kSmartLevels;
    return {};
}

const SliderDescription* single(EGUIMode mode) {
    if (mode < Mode_SmartSharpness || mode > Mode_ColorFilter)
        return nullptr;
    return &kSingle[mode - Mode_SmartSharpness];
}

} // namespace SliderTable

} // namespace orvela
