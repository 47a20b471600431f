#include "Settings/SliderTable.h"

#include <QCoreApplication>

#include <algorithm>
#include <stdexcept>

namespace orvela {

namespace SliderTable {

namespace {

using P = CSliderParams;
using S = SettingStage;
using Z = ZoneSet;
using namespace SliderScales;

constexpr SliderDescription kSliders[] = {
    {&P::Temperature_Value, &P::Temperature_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Temperature"),
     &Temperature, S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Makes the light warmer towards 2000 and cooler towards 10000, at the same brightness.")},
    {&P::GammaCorrectionValue, &P::GammaCorrectionEnabled, QT_TRANSLATE_NOOP("SliderTable", "Gamma"), &Gamma,
     S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Lightens the midtones above 1 and darkens them below; 1 changes nothing.")},
    {&P::BilinearFilteringValue, &P::BilinearFilteringEnabled, QT_TRANSLATE_NOOP("SliderTable", "Noise"),
     &Noise, S::Main, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Smooths noise and keeps edges: least at 0.5, most at 5. In large pictures its number "
                       "counts even while it is off, if Sharpness is on.")},
    {nullptr, &P::AutoContrast_Enabled, QT_TRANSLATE_NOOP("SliderTable", "AutoContrast"), &Tenth, S::Main,
     Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable", "Stretches the tones over the whole range; only on and off count.")},
    {&P::ContrastValue, &P::ContrastEnabled, QT_TRANSLATE_NOOP("SliderTable", "Contrast"), &Contrast, S::Main,
     Z::Neutral,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Sets light and dark further apart above 0 and closer together below, whatever the picture.")},
    {&P::Contrast2Value, &P::Contrast2Enabled, QT_TRANSLATE_NOOP("SliderTable", "Contrast"), &Tenth, S::Main,
     Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Sets light and dark further apart, as far as the picture bears it: not at all at 0, most at 100.")},
    {&P::BrightnessValue, &P::BrightnessEnabled, QT_TRANSLATE_NOOP("SliderTable", "Brightness"), &Brightness,
     S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Makes everything lighter above 0 and darker below, whatever the picture.")},
    {&P::Brightness2Value, &P::Brightness2Enabled, QT_TRANSLATE_NOOP("SliderTable", "Brightness"),
     &Brightness, S::Main, Z::CentredWide,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Makes the picture lighter above 0 and darker below, as far as it bears it.")},
    {&P::ClarityFilterValue, &P::ClarityFilterEnabled, QT_TRANSLATE_NOOP("SliderTable", "Illumination"),
     &Hundredth, S::Main, Z::Illumination,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Adds light, least to the brightest tones: hardly any at 0, most at 10.")},
    {&P::mDigital_Flash_Value, &P::DigitalFlashEnabled, QT_TRANSLATE_NOOP("SliderTable", "Digital Flash"),
     &Tenth, S::Main, Z::Strength,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Lights the picture as a flash would have: not at all at 0, most at 100.")},
    {&P::SaturationValue, &P::SaturationEnabled, QT_TRANSLATE_NOOP("SliderTable", "Saturation"), &Hundredth,
     S::Main, Z::Strength,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Makes colours paler below 5, grey at 0, and livelier above, most at 10.")},
    {&P::SaltPepperValue, &P::SaltPepperEnabled, QT_TRANSLATE_NOOP("SliderTable", "B&W Spots"), &Spots,
     S::Main, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable", "Takes isolated bright spots away when on; at every number as many.")},
    {&P::OrvelaLevelValue, &P::OrvelaLevelEnabled, QT_TRANSLATE_NOOP("SliderTable", "Sharpness I"),
     &Sharpness, S::Main, Z::Sharpness,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Brings out texture: 30 lightens the picture as well, 71 brings out most and keeps "
                       "its brightness. Its number counts even while only Sharpness II is on.")},
    {&P::OrvelaLevel2Value, &P::OrvelaLevel2Enabled, QT_TRANSLATE_NOOP("SliderTable", "Sharpness II"),
     &Sharpness, S::Main, Z::Sharpness,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Brings out texture once more: 30 lightens the picture as well, 71 brings out most "
                       "and keeps its brightness. Its number counts even while only Sharpness I is on.")},
    {&P::OrvelaLevel3Value, &P::OrvelaLevel3Enabled, QT_TRANSLATE_NOOP("SliderTable", "Smart Blur"),
     &Thousandth, S::Main, Z::Blur,
     QT_TRANSLATE_NOOP("SliderTable", "Smooths even areas and keeps edges: least at 0, most at 1.")},
    {&P::PerceptualDark, &P::PerceptualDarkEnabled, QT_TRANSLATE_NOOP("SliderTable", "Dark"), &Shadows,
     S::Main, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones, and less the shadows and the lightest tones, as "
                                      "far as the picture bears it: not at all at 0, most at 255.")},
    {&P::PerceptualMiddle, &P::PerceptualMiddleEnabled, QT_TRANSLATE_NOOP("SliderTable", "Middle"), &Gamma,
     S::Main, Z::CentredGamma,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Lightens the midtones above 1 and darkens them below, as far as the picture bears it.")},
    {&P::PerceptualLight, &P::PerceptualLightEnabled, QT_TRANSLATE_NOOP("SliderTable", "Highlights"),
     &Highlights, S::Main, Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights, as far as the picture bears it: not at all at 255, most at 0.")},
    {&P::mAbsolute_Dark_Value, &P::mAbsolute_Dark_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Dark"), &Shadows,
     S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones, and less the shadows and the lightest tones, "
                                      "whatever the picture: not at all at 0, most at 255.")},
    {&P::mAbsolute_Middle_Value, &P::mAbsolute_Middle_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Middle"),
     &Gamma, S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable", "Above 1 multiplies all tones, whatever the picture, until light ones "
                                      "are white; below 1 changes hardly anything.")},
    {&P::mAbsolute_Light_Value, &P::mAbsolute_Light_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Highlights"),
     &Highlights, S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable", "Brightens the highlights, whatever the picture: least just below 255, "
                                      "most at 0, and 255 itself does as 0.")},
    {&P::PerceptualGamma, &P::PerceptualGammaEnabled, QT_TRANSLATE_NOOP("SliderTable", "Gamma"), &Gamma,
     S::Main, Z::CentredGamma,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Lightens the whole picture above 1 and darkens it below, as far as it bears it.")},
    {&P::mMoire_Value, &P::Moire_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Moire"), &Moire, S::Main,
     Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable", "Puts the original back where processing made false patterns: in "
                                      "fewest places at 0.1, in most at 10.")},
    {&P::mAuto_Color_Value, &P::mAuto_Color_Enabled, QT_TRANSLATE_NOOP("SliderTable", "AutoColor"), &Tenth,
     S::Main, Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Removes colour casts by stretching each colour, from 56 on; up to 55 it leaves colours alone.")},
    {&P::mFade_Value, &P::mFade_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Fade"), &Tenth, S::Main, Z::Fade,
     QT_TRANSLATE_NOOP("SliderTable", "Brings the original back where sharpness or digital flash is on: none "
                                      "of it at 0, most at 100. Its number counts even while it is off.")},
    {&P::mColor_Effect_Intensity_Value, &P::mColor_Effect_Intensity_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Color Filter"), &Tenth, S::Main, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Tints the picture with the picked colour: not at all at 0, completely at 100.")},
    {&P::mContrast_Touch_Value, &P::mContrast_Touch_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Contrast"),
     &Contrast, S::FinalTouch, Z::Neutral,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Sets light and dark further apart above 0 and closer together below, whatever the picture.")},
    {&P::mPerceptual_Contrast_Touch_Value, &P::mPerceptual_Contrast_Touch_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Contrast"), &Tenth, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Sets light and dark further apart, as far as the picture bears it: not at all at 0, most at 100.")},
    {&P::mBrightness_Touch_Value, &P::mBrightness_Touch_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Brightness"), &Brightness, S::FinalTouch, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Makes everything lighter above 0 and darker below, whatever the picture.")},
    {&P::mPerceptual_Brightness_Touch_Value, &P::mPerceptual_Brightness_Touch_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Brightness"), &Brightness, S::FinalTouch, Z::CentredFinal,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Makes the picture lighter above 0 and darker below, as far as it bears it.")},
    {&P::mPerceptual_Touch_Dark_Value_R, &P::mPerceptual_Touch_Dark_R_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Shadows"), &Shadows, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones of red, and less its shadows and lightest tones, "
                                      "as far as the picture bears it: not at all at 0, most at 255.")},
    {&P::mPerceptual_Touch_Dark_Value_G, &P::mPerceptual_Touch_Dark_G_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Shadows"), &Shadows, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Darkens the midtones of green, and less its shadows and lightest tones, as far as "
                       "the picture bears it: not at all at 0, most at 255.")},
    {&P::mPerceptual_Touch_Dark_Value_B, &P::mPerceptual_Touch_Dark_B_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Shadows"), &Shadows, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Darkens the midtones of blue, and less its shadows and lightest tones, as far as the "
                       "picture bears it: not at all at 0, most at 255.")},
    {&P::mPerceptual_Touch_Dark_Value_RGB, &P::mPerceptual_Touch_Dark_RGB_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Shadows"), &Shadows, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Darkens the midtones of all colours, and less their shadows and lightest tones, as "
                       "far as the picture bears it: not at all at 0, most at 255.")},
    {&P::mPerceptual_Touch_Middle_Value_R, &P::mPerceptual_Touch_Middle_R_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Middle"), &Gamma, S::FinalTouch, Z::CentredFinal,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Lightens the midtones of red above 1 and darkens them below, as far as the picture bears it.")},
    {&P::mPerceptual_Touch_Middle_Value_G, &P::mPerceptual_Touch_Middle_G_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Middle"), &Gamma, S::FinalTouch, Z::CentredFinal,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Lightens the midtones of green above 1 and darkens them below, as far as the picture bears it.")},
    {&P::mPerceptual_Touch_Middle_Value_B, &P::mPerceptual_Touch_Middle_B_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Middle"), &Gamma, S::FinalTouch, Z::CentredFinal,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Lightens the midtones of blue above 1 and darkens them below, as far as the picture bears it.")},
    {&P::mPerceptual_Touch_Middle_Value_RGB, &P::mPerceptual_Touch_Middle_RGB_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Middle"), &Gamma, S::FinalTouch, Z::CentredFinalPale,
     QT_TRANSLATE_NOOP("SliderTable", "Lightens the midtones of all colours above 1 and darkens them below, "
                                      "as far as the picture bears it.")},
    {&P::mPerceptual_Touch_Light_Value_R, &P::mPerceptual_Touch_Light_R_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Highlights"), &Highlights, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of red, as far as the picture bears it: not at all at 255, most at 0.")},
    {&P::mPerceptual_Touch_Light_Value_G, &P::mPerceptual_Touch_Light_G_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Highlights"), &Highlights, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of green, as far as the picture bears it: not at all at 255, most at 0.")},
    {&P::mPerceptual_Touch_Light_Value_B, &P::mPerceptual_Touch_Light_B_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Highlights"), &Highlights, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of blue, as far as the picture bears it: not at all at 255, most at 0.")},
    {&P::mPerceptual_Touch_Light_Value_RGB, &P::mPerceptual_Touch_Light_RGB_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Highlights"), &Highlights, S::FinalTouch, Z::Standard,
     QT_TRANSLATE_NOOP("SliderTable", "Brightens the highlights of all colours, as far as the picture bears "
                                      "it: not at all at 255, most at 0.")},
    {&P::mDark_Touch_Value_R, &P::mDark_Touch_R_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Shadows"),
     &Shadows, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones of red, and less its shadows and lightest tones, "
                                      "whatever the picture: not at all at 0, most at 255.")},
    {&P::mDark_Touch_Value_G, &P::mDark_Touch_G_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Shadows"),
     &Shadows, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones of green, and less its shadows and lightest "
                                      "tones, whatever the picture: not at all at 0, most at 255.")},
    {&P::mDark_Touch_Value_B, &P::mDark_Touch_B_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Shadows"),
     &Shadows, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones of blue, and less its shadows and lightest "
                                      "tones, whatever the picture: not at all at 0, most at 255.")},
    {&P::mDark_Touch_Value_RGB, &P::mDark_Touch_RGB_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Shadows"),
     &Shadows, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable", "Darkens the midtones of all colours, and less their shadows and "
                                      "lightest tones, whatever the picture: not at all at 0, most at 255.")},
    {&P::mMiddle_Touch_Value_R, &P::mMiddle_Touch_R_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Middle"),
     &Gamma, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Multiplies the tones of red: lighter above 1, darker below, white included.")},
    {&P::mMiddle_Touch_Value_G, &P::mMiddle_Touch_G_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Middle"),
     &Gamma, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Multiplies the tones of green: lighter above 1, darker below, white included.")},
    {&P::mMiddle_Touch_Value_B, &P::mMiddle_Touch_B_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Middle"),
     &Gamma, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Multiplies the tones of blue: lighter above 1, darker below, white included.")},
    {&P::mMiddle_Touch_Value_RGB, &P::mMiddle_Touch_RGB_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Middle"),
     &Gamma, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Multiplies the tones of all colours: lighter above 1, darker below, white included.")},
    {&P::mLight_Touch_Value_R, &P::mLight_Touch_R_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Highlights"),
     &Highlights, S::FinalTouch, Z::Neutral,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of red, whatever the picture: not at all at 255, most at 0.")},
    {&P::mLight_Touch_Value_G, &P::mLight_Touch_G_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Highlights"),
     &Highlights, S::FinalTouch, Z::Neutral,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of green, whatever the picture: not at all at 255, most at 0.")},
    {&P::mLight_Touch_Value_B, &P::mLight_Touch_B_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Highlights"),
     &Highlights, S::FinalTouch, Z::Neutral,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of blue, whatever the picture: not at all at 255, most at 0.")},
    {&P::mLight_Touch_Value_RGB, &P::mLight_Touch_RGB_Enabled, QT_TRANSLATE_NOOP("SliderTable", "Highlights"),
     &Highlights, S::FinalTouch, Z::NeutralLight,
     QT_TRANSLATE_NOOP(
         "SliderTable",
         "Brightens the highlights of all colours, whatever the picture: not at all at 255, most at 0.")},
    {&P::mColor_Intensity_Touch_Value, &P::mColor_Touch_Enabled,
     QT_TRANSLATE_NOOP("SliderTable", "Color Filter"), &Tenth, S::FinalTouch, Z::Neutral,
     QT_TRANSLATE_NOOP("SliderTable",
                       "Tints the picture with the picked colour: not at all at 0, completely at 100.")},
};

constexpr ColorDescription kColors[] = {
    {{&P::mColor_Value_R, &P::mColor_Value_G, &P::mColor_Value_B},
     S::Main,
     QT_TRANSLATE_NOOP("SliderTable", "The colour with which Color Filter tints the picture.")},
    {{&P::mColor_Touch_Value_R, &P::mColor_Touch_Value_G, &P::mColor_Touch_Value_B},
     S::FinalTouch,
     QT_TRANSLATE_NOOP("SliderTable", "The colour with which Color Filter tints the finished picture.")},
};

} // namespace

std::span<const SliderDescription> sliders() {
    return kSliders;
}

const SliderDescription& slider(bool P::*enabled) {
    const auto* found =
        std::find_if(std::begin(kSliders), std::end(kSliders),
                     [enabled](const SliderDescription& each) { return each.enabled == enabled; });
    if (found == std::end(kSliders))
        throw std::out_of_range("no slider has this switch");
    return *found;
}

std::span<const ColorDescription> colors() {
    return kColors;
}

const ColorDescription& color(SettingStage stage) {
    return kColors[stage == S::Main ? 0 : 1];
}

} // namespace SliderTable

} // namespace orvela
