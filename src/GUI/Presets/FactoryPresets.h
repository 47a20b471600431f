#pragma once

#include "Utility/EGUIMode.h"

/// The presets that come with the program: one for each automatic mode, under the mode's identifier.
namespace FactoryPresets {

/// The mode of the factory preset of exactly that name. Any other name gives a message box and Portrait.
EGUIMode factoryPresetMode(const QString& name);

} // namespace FactoryPresets
