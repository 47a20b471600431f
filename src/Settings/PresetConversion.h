#pragma once

#include "Settings/CSliderParams.h"
#include "Settings/PresetTree.h"

namespace orvela {

/// Stored presets as settings and back, by the controls of the panes. Controls that mirror another one are
/// left out; setting the other one sets them.
namespace PresetConversion {

/// True for the modes with controls of their own: the automatic modes use those of Advanced.
bool hasControls(EGUIMode mode);

/// The controls of the mode's pane as the settings would have them.
PresetContent contentOf(EGUIMode mode, const CSliderParams& sliders);

/// The settings of a stored preset of the mode: positions are clamped to 0 to 1000, entries without a control
/// are skipped, controls without an entry are off and at 0.
CSliderParams paramsOf(EGUIMode mode, const PresetContent& content);

} // namespace PresetConversion

} // namespace orvela
