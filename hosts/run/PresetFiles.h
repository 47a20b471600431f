#pragma once

#include "Settings/EGUIMode.h"
#include "Settings/PresetFile.h"

#include <optional>
#include <string>
#include <vector>

namespace orvela {

/// Presets in files and in the settings store.
namespace PresetFiles {

/// @throws PresetError when the file cannot be read, is no preset or too large for one
PresetFile read(const std::string& path);

/// The preset file that a preset is written into: the one there, so that what else it holds is kept, or an
/// empty one.
/// @throws TargetError when nothing can be written there or a file must not be overwritten
/// @throws PresetError when the file is no preset
PresetFile toWriteInto(const std::string& path, bool overwrite);

/// Writes the whole file or, when that fails, leaves an older one as it was. @throws TargetError
void write(const PresetFile& preset, const std::string& path, bool overwrite);

/// To be called before the store is opened, which reads all of it. @throws PresetError when it is a pipe or
/// device or too large
void checkStore();

/// The settings of a preset in the store, or of one that comes with the program and need not be there; none
/// when there is no such preset.
std::optional<CSliderParams> stored(EGUIMode mode, const QString& name);

/// The settings that were last accepted in the mode's window; none when there are no such.
std::optional<CSliderParams> lastAccepted(EGUIMode mode);

/// Every name that stored() has a preset for.
std::vector<std::string> names(EGUIMode mode);

} // namespace PresetFiles

} // namespace orvela
