#pragma once

#include "command/ExitStatus.h"
#include "command/PhotographOptions.h"
#include "command/StopSignals.h"
#include "run/SettingOptions.h"

#include <optional>
#include <string>

namespace orvela {

/// The arguments of `orvela enhance`.
struct EnhanceOptions : PhotographOptions {
    SettingOptions settings;
    std::optional<std::string> savePreset;
    std::optional<std::string> log;   ///< file for the engine's log
    std::optional<std::string> trace; ///< folder for what each step did
    int threads = 0;                  ///< 0: one per processor

    /// Declares the arguments to the parser, which fills this object when it parses.
    void declare(CLI::App& app);
};

/// Enhances the photographs one after the other; a failed one does not keep the others from being done.
/// @throws UsageError and PresetError before any work has started, also when nothing would change
ExitStatus enhancePhotographs(const EnhanceOptions& options, StopSignals& signals);

} // namespace orvela
