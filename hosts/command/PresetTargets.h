#pragma once

#include "Settings/PresetFile.h"

namespace orvela {

/// The preset file that a preset is written into: the one there, so that what else it holds is kept, or an
/// empty one.
/// @throws PresetError when a file is there that must not be overwritten or is no preset
PresetFile presetToWriteInto(const QString& path, bool overwrite);

} // namespace orvela
