#pragma once

#include "Settings/CUserParams.h"
#include "Settings/PresetFile.h"

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace orvela {

/// The settings of a run as they were given on the command line. Numbers for sliders are shown numbers except
/// where positions are named.
struct SettingOptions {
    std::optional<std::string> mode = {};
    std::optional<std::string> value = {};            ///< of the mode's one slider
    std::map<std::string, std::string> labelled = {}; ///< of a mode with three sliders, by label
    std::optional<std::string> color = {};            ///< R,G,B of the colour filter, 0 to 255
    std::vector<std::string> fields = {};             ///< NAME=POSITION[,on|off] or NAME=on|off
    std::optional<std::string> preset = {};           ///< file to read, or stored preset
    std::optional<std::string> finalTouch = {};       ///< NAME=VALUE,...
};

/// What a run is to do.
struct RunSettings {
    CUserParamsPhotoshop params;           ///< for the main pipeline
    bool runsFinalTouch = false;           ///< whether the final-touch stage follows
    CUserParamsPhotoshop finalTouchParams; ///< for that stage
    PresetFile preset;                     ///< all of it as a preset, with what else the read file held
    std::vector<std::string> notes;        ///< for the user
    std::string idle; ///< why nothing would change and what to do; empty when something would
};

/// The labels of the sliders of the modes with three sliders, each once.
std::vector<std::string> labelsOfThreeSliders();

/// Later sources win: mode, preset, slider options, fields by name, final touch. A preset without a mode
/// starts from all sliders off; nothing at all from Automatic.
/// @throws UsageError for an unknown name or a value out of range, with what is allowed
/// @throws PresetError
RunSettings settle(const SettingOptions& options);

/// What was last accepted in the windows, as they replay it: the final touch alone when that was opened.
/// @throws UsageError when nothing was accepted in the mode that was opened last
RunSettings settleLast();

} // namespace orvela
