#include "command/EnhanceCommand.h"
#include "command/NearestNames.h"

#include <CLI/CLI.hpp>

namespace orvela {

namespace {

constexpr char kSettings[] = "Settings";

// The library's own takes what is no number, and names the largest one there is when it refuses.
const CLI::Validator kPositive(
    [](const std::string& text) {
        double number = 0;
        const bool fits = CLI::detail::lexical_cast(text, number) && number > 0;
        return fits ? std::string() : '"' + text + "\" is not a number above 0";
    },
    std::string());

void declareTargets(CLI::App& app, EnhanceOptions& options) {
    app.add_option("-o,--output", options.targets.file, "file for the result of one photograph")
        ->option_text("FILE");
    app.add_option("-d,--directory", options.targets.folder,
                   "folder for the results, under the names of the photographs; made when missing")
        ->option_text("FOLDER");
    app.add_flag("--force", options.writing.overwrite,
                 "overwrite results, presets and logs of earlier runs (never a photograph that is read)");
    app.add_flag("--keep-time", options.writing.keepTime,
                 "give results the time stamps of their photographs");
}

void declareEncoding(CLI::App& app, WriteOptions& writing) {
    constexpr char kEncoding[] = "Encoding (as the photograph where not given)";
    app.add_option("--quality", writing.quality, "of JPEG, WebP and HEIF results, 1 to 100")
        ->option_text("N")
        ->check(CLI::Range(1, 100))
        ->group(kEncoding);
    app.add_option_function<std::string>(
           "--chroma", [&writing](const std::string& text) { writing.chromaSubsampled = text == "half"; },
           "resolution of colour in JPEG and HEIF results")
        ->option_text("full|half")
        ->check(CLI::IsMember({"full", "half"}))
        ->group(kEncoding);
    app.add_option("--compression", writing.compression, "of TIFF results")
        ->option_text("NAME")
        ->check(CLI::IsMember({"none", "lzw", "deflate", "packbits", "zstd", "jpeg"}))
        ->group(kEncoding);
}

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
    app.add_option("PHOTO", photographs, "photographs, folders of photographs or patterns");
    app.add_flag("--first-frame", reading.firstOnly,
                 "of animations and files of several pages only the first picture");
    declareTargets(app, *this);
    declareEncoding(app, writing);
    declareSettings(app, settings);
    app.add_option("--save-preset", savePreset, "write the settings to a file")
        ->option_text("FILE")
        ->group(kSettings);
    app.add_option("--threads", threads, "number of threads (one per processor)")
        ->option_text("N")
        ->check(CLI::Range(1, 1024));
    app.add_option("--max-megapixels", reading.limits.megapixels,
                   "refuse photographs with more million pixels")
        ->option_text("N")
        ->check(kPositive);
    app.add_flag("--quiet", quiet, "no progress and no results, only errors");
    app.add_option("--log", log, "write the engine's log to a file")->option_text("FILE");
    app.add_option("--trace", trace, "write what each step did to an empty folder: pictures and statistics")
        ->option_text("FOLDER");
    app.footer(
        "The result stands beside its photograph as NAME-enhanced.EXT unless -o or -d is given.\n"
        "Exit status: 0 done, 1 a photograph failed, 2 wrong usage, 3 nothing matched, 4 a target that\n"
        "cannot be written, 5 not enough memory, 128+n ended by signal n; the highest of all photographs.");
}

} // namespace orvela
