#pragma once

#include "command/ExitStatus.h"

namespace orvela {

/// Lists every mode with what it does and its sliders with their ranges on standard output, as text or JSON.
ExitStatus listModes(bool asJson);

} // namespace orvela
