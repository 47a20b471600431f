#pragma once

#include "Settings/PresetTree.h"

namespace orvela {

/// The presets that come with the program: one for each automatic mode, among the presets of Advanced and
/// under the mode's identifier.
namespace FactoryPresets {

/// True for the automatic modes, 0 to 11.
bool isFactoryMode(EGUIMode mode);

/// The names, in the order of their modes.
QStringList names();

/// True for exactly one of the twelve names.
bool isFactoryPresetName(const QString& name);

/// True for the presets of Advanced with such a name.
bool isFactoryPreset(EGUIMode mode, const QString& name);

/// What the preset of that name holds when it comes: the exact settings of its mode, by the controls of
/// Advanced.
PresetContent contentOf(const QString& name);

/// The mode of the factory preset of exactly that name. Any other name gives a message box and Portrait.
EGUIMode factoryPresetMode(const QString& name);

/// The name of the factory preset of an automatic mode. Any other mode gives a message box and a text that is
/// no preset's name.
QString factoryPresetName(EGUIMode mode);

} // namespace FactoryPresets

} // namespace orvela
