#include "files/PhotographWriter.h"

#include "files/Conversion.h"
#include "files/PhotographEncoder.h"
#include "files/TargetFile.h"
#include "files/Thumbnail.h"
#include "metadata/MetadataWriter.h"

namespace orvela {

namespace {

namespace fs = std::filesystem;

FileFormat targetFormat(const Photograph& photograph, const fs::path& target) {
    const FileFormat format = writtenFormat(target);
    const std::string obstacle = formatObstacle(format, photograph);
    if (!obstacle.empty())
        throw PhotographError(target.string() + ": " + obstacle);
    return format;
}

} // namespace

FileFormat writtenFormat(const fs::path& target) {
    const std::optional<FileFormat> format = formatOfExtension(target);
    if (!format)
        throw PhotographError(target.string() + ": the extension \"" + target.extension().string() +
                              "\" names no known format; use .jpg, .png, .tif, .webp or .heic");
    if (*format == FileFormat::Psd)
        throw PhotographError(target.string() + ": " + formatObstacle(*format, {}));
    return *format;
}

void checkTarget(const Photograph& photograph, const fs::path& target, const WriteOptions& options) {
    targetFormat(photograph, target);
    checkTargetPath(target, photograph.source, options.overwrite);
}

std::vector<std::string> writePhotograph(const Photograph& photograph, const fs::path& target,
                                         const WriteOptions& options) {
    const FileFormat format = targetFormat(photograph, target);
    checkTargetPath(target, photograph.source, options.overwrite);
    const Conversion conversion = conversionFor(format, photograph);
    std::optional<Photograph> changed;
    if (changesSamples(conversion))
        changed = converted(photograph, conversion);
    const Photograph& written = changed ? *changed : photograph;
    PreparedMetadata metadata =
        prepareMetadata(photograph.metadata ? *photograph.metadata : Metadata(), format,
                        {photograph.width, photograph.height, thumbnailsOf(written)});
    const std::vector<std::string> lost = losses(conversion);
    metadata.lost.insert(metadata.lost.begin(), lost.begin(), lost.end());
    Bytes encoded = encodePhotograph(written, format, target, options, metadata.metadata);
    embedMetadata(metadata, encoded);
    std::vector<std::string> notes = metadataNotes(metadata, photograph.source.string());
    TargetFile file(target, photograph.source);
    file.write(encoded, options.stop);
    if (options.keepTime && !file.takeTimes(photograph.source))
        notes.push_back(target.string() + ": the time stamps of the photograph could not be kept");
    file.commit(options.overwrite);
    return notes;
}

} // namespace orvela
