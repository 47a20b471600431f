#pragma once

#include <QString>

/// The enhancement modes. Values 16 and 31 are not modes.
enum EGUIMode : int {
    Mode_Automatic = 0,
    Mode_AutomaticPro = 1,
    Mode_AutoContrast = 2,
    Mode_AutoLevels = 3,
    Mode_AutoColor = 4,
    Mode_AutoSaturation = 5,
    Mode_Portrait = 6,
    Mode_PortraitPro = 7,
    Mode_Macro = 8,
    Mode_MacroPro = 9,
    Mode_Landscape = 10,
    Mode_LandscapePro = 11,
    Mode_Advanced = 12,
    Mode_Custom = 13,
    Mode_Batch = 14,
    Mode_FinalTouch = 15,
    Mode_SmartSharpness = 17,
    Mode_SmartBlur = 18,
    Mode_AddIllumination = 19,
    Mode_AddDigitalFlash = 20,
    Mode_Saturation = 21,
    Mode_SmartContrast = 22,
    Mode_SmartBrightness = 23,
    Mode_SmartGamma = 24,
    Mode_SpotsRemoval = 25,
    Mode_NoiseReduction = 26,
    Mode_MoireReduction = 27,
    Mode_Temperature = 28,
    Mode_AutoColorFilter = 29,
    Mode_ColorFilter = 30,
    Mode_SmartLevels = 32,
    Mode_Adjustments = 33,
};

/// The mode's display name; for a value that is not a mode a debug warning and an empty text.
QString getModeAsString(EGUIMode mode);
