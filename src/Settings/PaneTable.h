#pragma once

#include "Settings/EGUIMode.h"
#include "Settings/SliderTable.h"

#include <optional>

namespace orvela {

/// A slider as a control of a pane.
struct PaneSlider {
    const char* object; ///< object name of the control, and key of its state in presets
    const SliderDescription& slider;
    double initial = 0;                   ///< position before a preset or the user sets one
    std::optional<ZoneSet> ownZones = {}; ///< track colours where they are not the slider's
    bool mirror = false;                  ///< follows another control of the slider; only that one is read

    ZoneSet zones() const { return ownZones.value_or(slider.zones); }
};

/// A picked colour as a control of a pane.
struct PaneColor {
    const char* object; ///< object name of the control, and key of its state in presets
    const ColorDescription& color;
};

/// Which controls the panes have.
namespace PaneTable {

/// The sliders of the mode's own pane, in the order in which they are set up; empty for a mode without one.
/// The automatic modes use that of Advanced.
std::span<const PaneSlider> sliders(EGUIMode mode);

/// The colour pickers of that pane, without those that mirror another one.
std::span<const PaneColor> colors(EGUIMode mode);

/// The slider of a single-filter mode (17 to 30); null for any other mode.
const PaneSlider* single(EGUIMode mode);

/// The three sliders of Smart Levels or Adjustments; empty for any other mode.
std::span<const PaneSlider> threeSliders(EGUIMode mode);

/// Puts the sliders and the colour of Final Touch to where its pane starts, and leaves the switches alone. A
/// midtone filter that one of the sliders switches on reads the positions of others, too.
void startFinalTouch(CSliderParams& settings);

} // namespace PaneTable

} // namespace orvela
