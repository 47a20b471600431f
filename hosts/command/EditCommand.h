#pragma once

#include "command/ExitStatus.h"
#include "command/PhotographOptions.h"
#include "command/StopSignals.h"

namespace orvela {

/// The arguments of `orvela edit`.
struct EditOptions : PhotographOptions {
    bool about = false;   ///< only shows what the filter tells about itself
    bool desktop = false; ///< started without a terminal: tells in a window, and overwrites nothing

    /// Declares the arguments to the parser, which fills this object when it parses.
    void declare(CLI::App& app);
};

/// Opens the photographs in the filter's windows, one after the other, and writes what the user accepts.
/// @throws UsageError before any window is opened
ExitStatus editPhotographs(EditOptions options, StopSignals& signals);

} // namespace orvela
