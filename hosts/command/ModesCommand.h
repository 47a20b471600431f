#pragma once

#include "command/ExitStatus.h"

#include <string>
#include <vector>

namespace orvela {

/// Lists every mode with what it does and its sliders with their ranges on standard output, as text or JSON.
ExitStatus listModes(bool asJson);

/// What listNames() knows: "modes", "settings" and "final-touch".
std::vector<std::string> nameKinds();

/// Lists names on standard output, one a line: identifiers of modes, settings for --set or sliders of the
/// final touch.
/// @param kind  one of nameKinds()
ExitStatus listNames(const std::string& kind);

} // namespace orvela
