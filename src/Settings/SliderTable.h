#pragma once

#include "Settings/CSliderParams.h"
#include "Settings/EGUIMode.h"
#include "Settings/SliderScale.h"

#include <span>

namespace orvela {

/// Where a slider stands in its pane.
enum class SliderGroup {
    Lighting,
    Perceptual,
    Absolute,
    Color,
    Artefacts,
    Texture,
    Global,
    Levels,
    LightAndColor,
    Single
};

/// One slider, described once for the panes, the command line, presets and help.
struct SliderDescription {
    const char* object;           ///< object name of the control
    const char* label;            ///< text shown beside it
    SliderGroup group;            ///< group box of its pane
    const SliderScale* scale;     ///< position and shown number
    double low;                   ///< shown number at position 0
    double high;                  ///< shown number at position 1000
    float CSliderParams::*value;  ///< field that holds the position; null when the position is not used
    bool CSliderParams::*enabled; ///< field that holds the on/off state
    int zones;                    ///< number of the set of track colours, 1 to 13
    double initial;               ///< position before a preset or the user sets one
};

namespace SliderTable {

/// The 26 sliders of the Advanced pane, in the order in which they are set up.
std::span<const SliderDescription> advanced();

/// The sliders of the Final Touch pane, the mirrored perceptual colour filter last (it has no fields of its
/// own).
std::span<const SliderDescription> finalTouch();

/// The three sliders of Smart Levels or Adjustments; empty for any other mode.
std::span<const SliderDescription> threeSliders(EGUIMode mode);

/// The slider of a single-filter mode (17 to 30); null for any other mode.
const SliderDescription* single(EGUIMode mode);

} // namespace SliderTable

} // namespace orvela
