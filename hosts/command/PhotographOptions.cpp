#include "command/PhotographOptions.h"

#include <CLI/CLI.hpp>

namespace orvela {

namespace {

// The library's own takes what is no number, and names the largest one there is when it refuses.
const CLI::Validator kPositive(
    [](const std::string& text) {
        double number = 0;
        const bool fits = CLI::detail::lexical_cast(text, number) && number > 0;
        return fits ? std::string() : '"' + text + "\" is not a number above 0";
    },
    std::string());

void declareTargets(CLI::App& app, PhotographOptions& options) {
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

} // namespace

void PhotographOptions::declare(CLI::App& app) {
    app.add_option("PHOTO", photographs, "photographs, folders of photographs or patterns");
    app.add_flag("--first-frame", reading.firstOnly,
                 "of animations and files of several pages only the first picture");
    declareTargets(app, *this);
    declareEncoding(app, writing);
    app.add_option("--max-megapixels", reading.limits.megapixels,
                   "refuse photographs with more million pixels")
        ->option_text("N")
        ->check(kPositive);
    app.add_flag("--quiet", quiet, "no progress and no results, only errors");
}

} // namespace orvela
