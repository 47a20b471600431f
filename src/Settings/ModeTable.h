#pragma once

#include "Settings/CSliderParams.h"
#include "Settings/EGUIMode.h"

#include <span>

namespace orvela {

/// One field that a mode sets: its position, and the switch that it turns on (null: the switch stays off).
struct FactorySetting {
    float CSliderParams::*value;
    float position;
    bool CSliderParams::*enabled;
};

/// What the system knows of a mode.
struct ModeDescription {
    EGUIMode mode;
    const char* displayName; ///< marked for translation in the context "ModeTable"
    const char* presetName;  ///< identifier of its factory preset; null when it has none
    bool hasSettings;        ///< false when no parameter object can be made for it
    std::span<const FactorySetting> factory;
    const char* summary; ///< what the mode does, in a few words
};

namespace ModeTable {

/// Every mode, in the order of their numbers.
std::span<const ModeDescription> all();

/// The mode's description; null for a value that is not a mode.
const ModeDescription* find(EGUIMode mode);

} // namespace ModeTable

} // namespace orvela
