#include "Settings/ModeTable.h"

#include "Utility/DebugBoxes.h"

#include <QCoreApplication>

#include <algorithm>

using namespace orvela;

namespace {

using P = CSliderParams;

constexpr FactorySetting kAutomatic[] = {
    {&P::OrvelaLevelValue, 500, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 500, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 100, &P::OrvelaLevel3Enabled},
    {&P::Contrast2Value, 100, &P::Contrast2Enabled},
    {&P::BilinearFilteringValue, 250, &P::BilinearFilteringEnabled},
    {&P::Brightness2Value, 600, nullptr},
    {&P::ClarityFilterValue, 600, nullptr},
    {&P::mDigital_Flash_Value, 700, nullptr},
    {&P::SaturationValue, 600, &P::SaturationEnabled},
    {&P::mAuto_Color_Value, 570, &P::mAuto_Color_Enabled},
    {&P::mMoire_Value, 0, &P::Moire_Enabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kAutomaticPro[] = {
    {&P::OrvelaLevelValue, 740, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 740, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 100, &P::OrvelaLevel3Enabled},
    {&P::Contrast2Value, 100, &P::Contrast2Enabled},
    {&P::BilinearFilteringValue, 250, &P::BilinearFilteringEnabled},
    {&P::Brightness2Value, 600, nullptr},
    {&P::ClarityFilterValue, 600, nullptr},
    {&P::mDigital_Flash_Value, 600, nullptr},
    {&P::SaturationValue, 800, &P::SaturationEnabled},
    {&P::mAuto_Color_Value, 570, &P::mAuto_Color_Enabled},
    {&P::mMoire_Value, 0, &P::Moire_Enabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kPortrait[] = {
    {&P::Contrast2Value, 550, &P::Contrast2Enabled},
    {&P::mAuto_Color_Value, 700, &P::mAuto_Color_Enabled},
    {&P::PerceptualDark, 500, &P::PerceptualDarkEnabled},
    {&P::PerceptualMiddle, 500, &P::PerceptualMiddleEnabled},
    {&P::PerceptualLight, 600, &P::PerceptualLightEnabled},
    {&P::SaltPepperValue, 500, nullptr},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kPortraitPro[] = {
    {&P::OrvelaLevelValue, 500, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 500, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 100, &P::OrvelaLevel3Enabled},
    {&P::Contrast2Value, 550, &P::Contrast2Enabled},
    {&P::SaturationValue, 600, &P::SaturationEnabled},
    {&P::mAuto_Color_Value, 700, &P::mAuto_Color_Enabled},
    {&P::PerceptualDark, 500, &P::PerceptualDarkEnabled},
    {&P::PerceptualMiddle, 500, &P::PerceptualMiddleEnabled},
    {&P::PerceptualLight, 600, &P::PerceptualLightEnabled},
    {&P::SaltPepperValue, 500, nullptr},
    {&P::mMoire_Value, 0, &P::Moire_Enabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kLandscape[] = {
    {&P::OrvelaLevelValue, 293, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 293, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 150, &P::OrvelaLevel3Enabled},
    {&P::Contrast2Value, 100, &P::Contrast2Enabled},
    {&P::BilinearFilteringValue, 250, &P::BilinearFilteringEnabled},
    {&P::Brightness2Value, 600, nullptr},
    {&P::ClarityFilterValue, 600, nullptr},
    {&P::mDigital_Flash_Value, 600, nullptr},
    {&P::SaturationValue, 700, &P::SaturationEnabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kLandscapePro[] = {
    {&P::OrvelaLevelValue, 700, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 700, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 100, &P::OrvelaLevel3Enabled},
    {&P::Contrast2Value, 100, &P::Contrast2Enabled},
    {&P::BilinearFilteringValue, 250, &P::BilinearFilteringEnabled},
    {&P::Brightness2Value, 600, nullptr},
    {&P::ClarityFilterValue, 600, nullptr},
    {&P::mDigital_Flash_Value, 600, nullptr},
    {&P::SaturationValue, 800, &P::SaturationEnabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kMacro[] = {
    {&P::OrvelaLevelValue, 513, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 513, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 0, &P::OrvelaLevel3Enabled},
    {&P::BilinearFilteringValue, 251, &P::BilinearFilteringEnabled},
    {&P::ClarityFilterValue, 600, nullptr},
    {&P::mDigital_Flash_Value, 300, nullptr},
    {&P::SaturationValue, 700, &P::SaturationEnabled},
    {&P::SaltPepperValue, 218, &P::SaltPepperEnabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kMacroPro[] = {
    {&P::OrvelaLevelValue, 750, &P::OrvelaLevelEnabled},
    {&P::OrvelaLevel2Value, 750, &P::OrvelaLevel2Enabled},
    {&P::OrvelaLevel3Value, 0, &P::OrvelaLevel3Enabled},
    {&P::BilinearFilteringValue, 251, &P::BilinearFilteringEnabled},
    {&P::ClarityFilterValue, 600, nullptr},
    {&P::mDigital_Flash_Value, 300, nullptr},
    {&P::SaturationValue, 750, &P::SaturationEnabled},
    {&P::SaltPepperValue, 218, &P::SaltPepperEnabled},
    {&P::mFade_Value, 1, &P::mFade_Enabled},
};

constexpr FactorySetting kAutoContrast[] = {
    {nullptr, 0, &P::AutoContrast_Enabled},
    {&P::Contrast2Value, 1000, &P::Contrast2Enabled},
};

constexpr FactorySetting kAutoLevels[] = {
    {&P::PerceptualDark, 800, &P::PerceptualDarkEnabled},
    {&P::PerceptualMiddle, 500, &P::PerceptualMiddleEnabled},
    {&P::PerceptualLight, 800, &P::PerceptualLightEnabled},
};

constexpr FactorySetting kAutoColor[] = {{&P::mAuto_Color_Value, 700, &P::mAuto_Color_Enabled}};

constexpr FactorySetting kAutoSaturation[] = {{&P::SaturationValue, 750, &P::SaturationEnabled}};

// The single slider of the mode comes from the slider table; this is the colour its picker starts with.
constexpr FactorySetting kColorFilter[] = {
    {&P::mColor_Value_R, 0, nullptr},
    {&P::mColor_Value_G, 255, nullptr},
    {&P::mColor_Value_B, 0, nullptr},
};

constexpr ModeDescription kModes[] = {
    {Mode_Automatic, QT_TRANSLATE_NOOP("ModeTable", "Automatic"), "Automatic", true, kAutomatic,
     "light, colour, contrast and noise of any picture"},
    {Mode_AutomaticPro, QT_TRANSLATE_NOOP("ModeTable", "AutomaticPro"), "AutomaticPro", true, kAutomaticPro,
     "as Automatic, with a stronger hand"},
    {Mode_AutoContrast, QT_TRANSLATE_NOOP("ModeTable", "Auto Contrast"), "AutoContrast", true, kAutoContrast,
     "contrast stretched to the full range"},
    {Mode_AutoLevels, QT_TRANSLATE_NOOP("ModeTable", "Auto Levels"), "AutoLevels", true, kAutoLevels,
     "shadows, midtones and highlights balanced"},
    {Mode_AutoColor, QT_TRANSLATE_NOOP("ModeTable", "Auto Color"), "AutoColor", true, kAutoColor,
     "colour casts removed"},
    {Mode_AutoSaturation, QT_TRANSLATE_NOOP("ModeTable", "Auto Saturation"), "AutoSaturation", true,
     kAutoSaturation, "livelier colours"},
    {Mode_Portrait, QT_TRANSLATE_NOOP("ModeTable", "Portrait"), "Portrait", true, kPortrait,
     "gentle levels and colour for people"},
    {Mode_PortraitPro, QT_TRANSLATE_NOOP("ModeTable", "PortraitPro"), "PortraitPro", true, kPortraitPro,
     "as Portrait, with light and texture"},
    {Mode_Macro, QT_TRANSLATE_NOOP("ModeTable", "Macro"), "Macro", true, kMacro,
     "texture and clean detail close up"},
    {Mode_MacroPro, QT_TRANSLATE_NOOP("ModeTable", "MacroPro"), "MacroPro", true, kMacroPro,
     "as Macro, with a stronger hand"},
    {Mode_Landscape, QT_TRANSLATE_NOOP("ModeTable", "Landscape"), "Landscape", true, kLandscape,
     "light, texture and colour of open views"},
    {Mode_LandscapePro, QT_TRANSLATE_NOOP("ModeTable", "LandscapePro"), "LandscapePro", true, kLandscapePro,
     "as Landscape, with a stronger hand"},
    {Mode_Advanced, QT_TRANSLATE_NOOP("ModeTable", "Advanced"), nullptr, true, {}, "every setting by hand"},
    {Mode_Custom, QT_TRANSLATE_NOOP("ModeTable", "Custom"), nullptr, true, {}, "a stored preset"},
    {Mode_Batch, QT_TRANSLATE_NOOP("ModeTable", "Batch"), nullptr, false, {}, "the last operation again"},
    {Mode_FinalTouch,
     QT_TRANSLATE_NOOP("ModeTable", "Final Touch"),
     nullptr,
     true,
     {},
     "levels and colour of a finished picture"},
    {Mode_SmartSharpness,
     QT_TRANSLATE_NOOP("ModeTable", "Smart Sharpness"),
     nullptr,
     true,
     {},
     "local contrast that brings out texture"},
    {Mode_SmartBlur,
     QT_TRANSLATE_NOOP("ModeTable", "Smart Blur"),
     nullptr,
     true,
     {},
     "smooth areas smoothed, edges kept"},
    {Mode_AddIllumination,
     QT_TRANSLATE_NOOP("ModeTable", "Add Illumination"),
     nullptr,
     true,
     {},
     "more light in the midtones"},
    {Mode_AddDigitalFlash,
     QT_TRANSLATE_NOOP("ModeTable", "Add Digital Flash"),
     nullptr,
     true,
     {},
     "light where a flash would have put it"},
    {Mode_Saturation,
     QT_TRANSLATE_NOOP("ModeTable", "Saturation"),
     nullptr,
     true,
     {},
     "stronger or weaker colours"},
    {Mode_SmartContrast,
     QT_TRANSLATE_NOOP("ModeTable", "Smart Contrast"),
     nullptr,
     true,
     {},
     "contrast that spares shadows and highlights"},
    {Mode_SmartBrightness,
     QT_TRANSLATE_NOOP("ModeTable", "Smart Brightness"),
     nullptr,
     true,
     {},
     "brightness within what the picture bears"},
    {Mode_SmartGamma,
     QT_TRANSLATE_NOOP("ModeTable", "Smart Gamma"),
     nullptr,
     true,
     {},
     "midtones lighter or darker"},
    {Mode_SpotsRemoval,
     QT_TRANSLATE_NOOP("ModeTable", "B&W Spots Removal"),
     nullptr,
     true,
     {},
     "isolated bright spots removed"},
    {Mode_NoiseReduction,
     QT_TRANSLATE_NOOP("ModeTable", "Noise Reduction"),
     nullptr,
     true,
     {},
     "noise smoothed, edges kept"},
    {Mode_MoireReduction,
     QT_TRANSLATE_NOOP("ModeTable", "Moire Reduction"),
     nullptr,
     true,
     {},
     "moiré patterns reduced"},
    {Mode_Temperature,
     QT_TRANSLATE_NOOP("ModeTable", "Temperature"),
     nullptr,
     true,
     {},
     "warmer or cooler light"},
    {Mode_AutoColorFilter,
     QT_TRANSLATE_NOOP("ModeTable", "Auto Color"),
     nullptr,
     true,
     {},
     "colour casts removed, as strongly as you like"},
    {Mode_ColorFilter, QT_TRANSLATE_NOOP("ModeTable", "Color Filter"), nullptr, true, kColorFilter,
     "a coloured glass before the lens"},
    {Mode_SmartLevels,
     QT_TRANSLATE_NOOP("ModeTable", "Smart Levels"),
     nullptr,
     true,
     {},
     "highlights, midtones and shadows"},
    {Mode_Adjustments,
     QT_TRANSLATE_NOOP("ModeTable", "Adjustments"),
     nullptr,
     true,
     {},
     "saturation, highlights and shadows"},
};

} // namespace

namespace orvela {

namespace ModeTable {

std::span<const ModeDescription> all() {
    return kModes;
}

const ModeDescription* find(EGUIMode mode) {
    const auto* found = std::find_if(std::begin(kModes), std::end(kModes),
                                     [mode](const ModeDescription& each) { return each.mode == mode; });
    return found == std::end(kModes) ? nullptr : found;
}

} // namespace ModeTable

} // namespace orvela

QString getModeAsString(EGUIMode mode) {
    if (const ModeDescription* description = ModeTable::find(mode))
        return QString::fromUtf8(description->displayName);
    DebugBoxes::debugWarning(QStringLiteral("Unknown mode in getModeAsString %1").arg(static_cast<int>(mode)),
                             QStringLiteral("Debug Warning"));
    return {};
}
