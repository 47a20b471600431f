#pragma once

#include "command/ExitStatus.h"

#include <functional>
#include <string>

namespace CLI {
class App;
}

namespace orvela {

/// The arguments of `orvela presets`: the presets that the windows keep in the settings store, as files.
struct PresetsOptions {
    std::string mode = "Advanced";
    std::string name;
    std::string file;
    bool overwrite = false; ///< a preset or file of that name

    /// Declares the subcommands to the parser, which calls `chosen` with what is to be done.
    void declare(CLI::App& app, const std::function<void(std::function<ExitStatus()>)>& chosen);
};

/// Writes the names of the mode's presets to standard output, one a line.
/// @throws UsageError for a mode without presets
ExitStatus listPresets(const PresetsOptions& options);

/// Writes a stored preset to a file. What else an overwritten preset file holds stays in it.
/// @throws UsageError
ExitStatus exportPreset(const PresetsOptions& options);

/// Stores the settings of a file as a preset, under the file's name when none is given.
/// @throws UsageError, PresetError (the file cannot be read or is no preset)
ExitStatus importPreset(const PresetsOptions& options);

/// Removes a stored preset that did not come with the program.
/// @throws UsageError
ExitStatus removePreset(const PresetsOptions& options);

} // namespace orvela
