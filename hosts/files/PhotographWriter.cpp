#include "files/PhotographWriter.h"

#include "files/Conversion.h"
#include "files/DeclaredPicture.h"
#include "files/LibTiff.h"
#include "files/PhotographEncoder.h"
#include "files/TargetFile.h"
#include "files/Thumbnail.h"
#include "files/TiffFields.h"
#include "files/TiffWriter.h"
#include "metadata/MetadataWriter.h"
#include "metadata/PngChunks.h"

#include <algorithm>

namespace orvela {

namespace {

namespace fs = std::filesystem;

FileFormat targetFormat(const Photograph& photograph, const fs::path& target) {
    const FileFormat format = writtenFormat(target);
    const std::string obstacle = formatObstacle(format, photograph);
    if (!obstacle.empty())
        throw PhotographError(target.string() + ": " + obstacle);
    if (photograph.pages > 1 && format != FileFormat::Tiff)
        throw PhotographError(target.string() + ": " + formatName(format) + " cannot hold the " +
                              std::to_string(photograph.pages) + " pages of " + photograph.source.string() +
                              "; choose a TIFF target, or --first-frame for the first page");
    return format;
}

PreparedMetadata metadataFor(const Photograph& photograph, FileFormat target) {
    PreparedMetadata metadata = prepareMetadata(
        photograph.metadata ? *photograph.metadata : Metadata(), target,
        {photograph.width, photograph.height, thumbnailsOf(photograph), !photograph.iccProfile.empty()});
    metadata.lost.insert(metadata.lost.end(), photograph.unheld.begin(), photograph.unheld.end());
    return metadata;
}

bool hasMakerNote(const Bytes& exif) {
    if (exif.empty())
        return false;
    const TiffView view(exif);
    const ExifDirectories directories = exifDirectories(view, view.first());
    const TagDirectory* found = directories.find(tiff::ExifIfd);
    return found != nullptr && found->find(tiff::MakerNote) != nullptr;
}

// Of the page that it comes from, if any.
std::uint64_t storedCompression(const Photograph& photograph, const TiffStorage& storage) {
    return photograph.tiffPage ? photograph.tiffPage->number(TIFFTAG_COMPRESSION, COMPRESSION_NONE)
                               : storage.compression;
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
    const FileFormat format = targetFormat(photograph, target);
    if (photograph.copied && (photograph.pages == 1 || format != FileFormat::Tiff))
        throw PhotographError(photograph.source.string() +
                              ": holds a transparency mask where a picture is wanted; choose the photograph "
                              "that it belongs to, or a TIFF target for all its pages");
    checkTargetPath(target, photograph.source, options.overwrite);
    checkEncoding(photograph, formatName(format), encoderBytes(photograph, format, target, options));
}

PhotographWriter::PhotographWriter(fs::path target, const WriteOptions& options)
    : mTarget(std::move(target)), mOptions(options) {}

PhotographWriter::~PhotographWriter() = default;

void PhotographWriter::add(const Photograph& photograph) {
    const FileFormat format = targetFormat(photograph, mTarget);
    if (!hasBegun()) {
        checkTargetPath(mTarget, photograph.source, mOptions.overwrite);
        mSource = photograph.source;
        mPages = photograph.pages;
    }
    const Conversion conversion = conversionFor(format, photograph);
    std::optional<Photograph> changed;
    if (changesSamples(conversion))
        changed = converted(photograph, conversion);
    const Photograph& written = changed ? *changed : photograph;
    PreparedMetadata metadata = metadataFor(written, format);
    const std::vector<std::string> lost = losses(conversion);
    metadata.lost.insert(metadata.lost.begin(), lost.begin(), lost.end());
    if (format == FileFormat::Tiff)
        addPage(written, metadata);
    else
        addEncoded(written, metadata);
    take(metadataNotes(metadata), photograph.page);
    take(photograph.notes, photograph.page);
}

void PhotographWriter::addPage(const Photograph& photograph, PreparedMetadata& prepared) {
    const Metadata& metadata = prepared.metadata;
    const ByteOrder order = photograph.tiffPage     ? photograph.tiffPage->order
                            : metadata.exif.empty() ? ByteOrder::Little
                                                    : TiffView(metadata.exif).order();
    try {
        const TiffStorage storage = tiffStorage(photograph, mOptions);
        if (!hasBegun()) {
            mFile = std::make_unique<TargetFile>(mTarget, mSource);
            mTiff = std::make_unique<TiffWriter>(*mFile, order, metadata.exif, mOptions.stop);
        } else if (hasMakerNote(metadata.exif)) {
            prepared.lost.emplace_back("what the maker note refers to by its place");
        }
        if (photograph.copied) {
            mTiff->addCopy(photograph.tiffPage->blocks, copiedFields(*photograph.tiffPage, prepared.lost));
        } else {
            if (mOptions.compression.empty() && storage.compression != storedCompression(photograph, storage))
                prepared.lost.push_back(std::string("its kind of compression (") +
                                        tiffCompressionName(storage.compression) + " is written)");
            mTiff->addPicture(photograph, storage, pageFields(photograph, metadata, order, prepared.lost));
        }
    } catch (const TiffError& error) {
        throw PhotographError(mTarget.string() + ": TIFF encoding failed (" + error.what() +
                              "); choose other settings or another format");
    }
}

void PhotographWriter::addEncoded(const Photograph& photograph, PreparedMetadata& metadata) {
    Bytes encoded = encodePhotograph(photograph, metadata.target, mTarget, mOptions, metadata.metadata);
    embedMetadata(metadata, encoded);
    // The library leaves out one that is damaged, or for other colours than the picture's.
    if (metadata.target == FileFormat::Png && !photograph.iccProfile.empty() && !hasPngChunk(encoded, "iCCP"))
        metadata.lost.emplace_back(kUnsuitedProfile);
    mFile = std::make_unique<TargetFile>(mTarget, mSource);
    mFile->write(encoded, mOptions.stop);
}

void PhotographWriter::take(const std::vector<std::string>& notes, int page) {
    for (const std::string& text : notes) {
        const auto same =
            std::find_if(mNotes.begin(), mNotes.end(), [&](const Note& note) { return note.text == text; });
        if (same == mNotes.end())
            mNotes.push_back({text, page, 1});
        else
            ++same->times;
    }
}

std::string PhotographWriter::prefix(const Note& note) const {
    std::string text = mSource.string() + ": ";
    if (mPages == 1)
        return text;
    text += "page " + std::to_string(note.page + 1);
    if (note.times > 1)
        text += " and " + std::to_string(note.times - 1) + " more";
    return text + ": ";
}

std::vector<std::string> PhotographWriter::commit() {
    if (mTiff)
        mTiff->finish();
    std::vector<std::string> warnings;
    if (mOptions.keepTime && !mFile->takeTimes(mSource))
        warnings.push_back(mTarget.string() + ": the time stamps of the photograph could not be kept");
    mFile->commit(mOptions.overwrite);
    for (const Note& note : mNotes)
        warnings.push_back(prefix(note) + note.text);
    return warnings;
}

std::vector<std::string> writePhotograph(const Photograph& photograph, const fs::path& target,
                                         const WriteOptions& options) {
    PhotographWriter writer(target, options);
    writer.add(photograph);
    return writer.commit();
}

} // namespace orvela
