#include "files/PhotographWriter.h"

#include "files/Conversion.h"
#include "files/Metadata.h"
#include "files/PhotographEncoder.h"
#include "files/TargetFile.h"

namespace orvela {

namespace {

namespace fs = std::filesystem;

FileFormat targetFormat(const Photograph& photograph, const fs::path& target) {
    const std::optional<FileFormat> format = formatOfExtension(target);
    if (!format)
        throw PhotographError(target.string() + ": the extension \"" + target.extension().string() +
                              "\" names no known format; use .jpg, .png, .tif, .webp or .heic");
    const std::string obstacle = formatObstacle(*format, photograph);
    if (!obstacle.empty())
        throw PhotographError(target.string() + ": " + obstacle);
    return *format;
}

// One line about all that the target cannot hold; none when it holds all.
std::vector<std::string> lossesLine(const Photograph& photograph, FileFormat format,
                                    std::vector<std::string> lost) {
    lost.insert(lost.end(), photograph.unheld.begin(), photograph.unheld.end());
    std::string line;
    for (const std::string& one : lost)
        line += (line.empty() ? "" : "; ") + one;
    if (line.empty())
        return {};
    return {photograph.source.string() + ": the " + formatName(format) + " file cannot hold: " + line};
}

} // namespace

void checkTarget(const Photograph& photograph, const fs::path& target, const WriteOptions& options) {
    targetFormat(photograph, target);
    checkTargetPath(target, photograph.source, options.overwrite);
}

std::vector<std::string> writePhotograph(const Photograph& photograph, const fs::path& target,
                                         const WriteOptions& options) {
    const FileFormat format = targetFormat(photograph, target);
    checkTargetPath(target, photograph.source, options.overwrite);
    const Conversion conversion = conversionFor(format, photograph);
    std::vector<std::string> warnings = lossesLine(photograph, format, losses(conversion));
    Bytes encoded = changesSamples(conversion)
                        ? encodePhotograph(converted(photograph, conversion), format, target, options)
                        : encodePhotograph(photograph, format, target, options);
    const std::vector<std::string> others = copyMetadata(photograph, format, encoded);
    warnings.insert(warnings.end(), others.begin(), others.end());
    TargetFile file(target);
    file.write(encoded, options.stop);
    file.commit(options.overwrite);
    return warnings;
}

} // namespace orvela
