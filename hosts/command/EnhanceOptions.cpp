#include "command/EnhanceCommand.h"
#include "run/NearestNames.h"

#include <CLI/CLI.hpp>

namespace orvela {

namespace {

constexpr char kSettings[] = "Settings";

void declareSettings(CLI::App& app, SettingOptions& settings) {
    app.add_option("--mode", settings.mode, "what to do, by name (Automatic); `orvela modes` lists all")
        ->option_text("NAME")
        ->group(kSettings);
    app.add_option("--value", settings.value, "shown number of the slider of a mode with one slider")
        ->option_text("NUMBER")
        ->group(kSettings);
    for (const std::string& label : labelsOfThreeSliders())
        app.add_option_function<std::string>(
               "--" + NearestNames::plain(label),
               [&settings, label](const std::string& text) { settings.labelled[label] = text; },
               "shown number of that slider of Adjustments or Smart Levels")
            ->option_text("NUMBER")
            ->group(kSettings);
    app.add_option("--colour,--color", settings.color, "colour of the colour filter, 0 to 255 each")
        ->option_text("R,G,B")
        ->group(kSettings);
    app.add_option("--set", settings.fields,
                   "any setting by its name: NAME=POSITION[,on|off] (0 to 1000) or NAME=on|off; repeatable")
        ->option_text("NAME=...")
        ->allow_extra_args(false)
        ->group(kSettings);
    app.add_option("--final-touch", settings.finalTouch,
                   "finish the result: final-touch sliders and their shown numbers")
        ->option_text("NAME=NUMBER,...")
        ->group(kSettings);
    app.add_option("--preset", settings.preset,
                   "read settings from a file, or a stored preset of the mode (Advanced); without --mode "
                   "nothing else is on")
        ->option_text("FILE|NAME")
        ->group(kSettings);
}

} // namespace

void EnhanceOptions::declare(CLI::App& app) {
    PhotographOptions::declare(app);
    declareSettings(app, settings);
    app.add_option("--save-preset", savePreset, "write the settings to a file")
        ->option_text("FILE")
        ->group(kSettings);
    app.add_option("--threads", threads, "number of threads (one per processor)")
        ->option_text("N")
        ->check(CLI::Range(1, 1024));
    app.add_option("--log", log, "write the engine's log to a file")->option_text("FILE");
    app.add_option("--trace", trace, "write what each step did to an empty folder: pictures and statistics")
        ->option_text("FOLDER");
    app.footer(
        "The result stands beside its photograph as NAME-enhanced.EXT unless -o or -d is given.\n"
        "Exit status: 0 done, 1 a photograph failed, 2 wrong usage, 3 nothing matched, 4 a target that\n"
        "cannot be written, 5 not enough memory, 128+n ended by signal n; the highest of all photographs.");
}

} // namespace orvela
