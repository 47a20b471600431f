#include "files/PhotographReader.h"

#include "files/CameraRaw.h"
#include "files/HeifBoxes.h"
#include "files/HeifReader.h"
#include "files/JpegReader.h"
#include "files/PsdFile.h"
#include "files/Refusal.h"
#include "files/SourceFile.h"
#include "files/TiffReader.h"
#include "files/VipsPhotograph.h"
#include "metadata/MetadataReader.h"
#include "metadata/PngChunks.h"
#include "metadata/WebPMetadata.h"

#include <webp/decode.h>

#include <algorithm>

namespace orvela {

namespace {

namespace fs = std::filesystem;

constexpr std::uint64_t kHeadBytes = 512; // that tell the kind of a file

VipsImage* load(const Bytes& file, FileFormat format) {
    void* data = const_cast<std::uint8_t*>(file.data());
    VipsImage* image = nullptr;
    const auto run = [&](auto loader) {
        return loader(data, file.size(), &image, "access", VIPS_ACCESS_SEQUENTIAL, "fail_on",
                      VIPS_FAIL_ON_TRUNCATED, nullptr);
    };
    switch (format) {
    case FileFormat::Png:
        run(vips_pngload_buffer);
        break;
    case FileFormat::WebP:
        run(vips_webpload_buffer);
        break;
    case FileFormat::Jpeg: // these have readers of their own
    case FileFormat::Heif:
    case FileFormat::Tiff: // see TiffReader
    case FileFormat::Psd:  // see PsdFile
        break;
    }
    return image;
}

// libvips asks memory for the whole picture before it tells the size. What is damaged is left to it.
void checkWebp(const fs::path& path, const Bytes& file, const ReadLimits& limits) {
    WebPBitstreamFeatures features{};
    if (WebPGetFeatures(file.data(), file.size(), &features) == VP8_STATUS_OK)
        checkPicture({features.width, features.height, features.has_alpha != 0 ? 4U : 3U, file.size(),
                      bounds::ofWebp(file)},
                     path, limits);
}

VipsHandle open(const fs::path& path, const Bytes& file, FileFormat format, const ReadLimits& limits) {
    startVips();
    vips_error_clear();
    if (format == FileFormat::Png && !hasPngChunk(file, "IEND"))
        refuse(path, "the file is cut short", kCopyAgain);
    if (format == FileFormat::WebP)
        checkWebp(path, file, limits);
    VipsHandle image(load(file, format));
    if (!image)
        refuseUnread(path, takeVipsError());
    return image;
}

Encoding encodingOf(const Bytes& file, FileFormat format) {
    Encoding encoding;
    encoding.format = format;
    if (format == FileFormat::Png)
        encoding.progressive = file.size() > 28 && file[28] == 1;
    if (format == FileFormat::WebP)
        encoding.lossless = webpPictures(file).lossless;
    return encoding;
}

// Depth and kind of colour stand in the first chunk.
void noteExpansion(Photograph& photograph, const Bytes& png) {
    constexpr std::uint8_t palette = 3;
    if (png.size() > 25 && png[25] == palette)
        photograph.notes.emplace_back(kPaletteNote);
    else if (png.size() > 25 && png[24] < 8)
        photograph.notes.emplace_back(kBitsNote);
}

// The 25th byte tells the bits of a sample. That of a WebP was looked at before.
double mostPixelsPerByte(const Bytes& file, FileFormat format) {
    if (format == FileFormat::Png && file.size() > 24 && file[24] > 0)
        return bounds::kDeflate * 8 / file[24];
    return bounds::kNone;
}

Photograph decodeFile(const Bytes& file, FileFormat format, const fs::path& path, const ReadLimits& limits) {
    const VipsHandle image = open(path, file, format, limits);
    Photograph photograph = describeImage(path, image.get());
    checkPicture({photograph.width, photograph.height, sampleBytes(photograph), file.size(),
                  mostPixelsPerByte(file, format)},
                 path, limits);
    photograph.encoding = encodingOf(file, format);
    if (format == FileFormat::Png)
        noteExpansion(photograph, file);
    takeSamples(photograph, path, image.get());
    return photograph;
}

void refuseAnimation(const fs::path& path, const char* kind, int frames) {
    refuse(path, "is " + std::string(kind) + " of " + std::to_string(frames) + " frames",
           "--first-frame enhances the first");
}

void refuseCameraRaw(const fs::path& path) {
    refuse(path, "is a camera's raw file", "develop it first, and enhance the TIFF or JPEG that you get");
}

// How many pictures the file shows one after the other.
int framesOf(const fs::path& path, const Bytes& file, FileFormat format, bool firstOnly) {
    int frames = 1;
    if (format == FileFormat::Png)
        frames = pngFrames(file);
    if (format == FileFormat::WebP)
        frames = webpPictures(file).frames;
    if (format == FileFormat::Heif) {
        const HeifPictures pictures = heifPictures(file);
        if (pictures.frames > 0 && !pictures.still)
            refuse(path, "is an image sequence without a still picture", "save its frames as pictures");
        frames = pictures.frames;
    }
    if (frames > 1 && !firstOnly)
        refuseAnimation(path, format == FileFormat::Heif ? "an image sequence" : "an animation", frames);
    return frames;
}

// Exif's density counts only where the container says nothing.
void takeResolution(Photograph& photograph) {
    const std::optional<Density> density =
        photograph.metadata ? densityOf(*photograph.metadata) : std::optional<Density>();
    if (!density || density->millimetres() == 0)
        return;
    photograph.xResolution = density->x.value() / density->millimetres();
    photograph.yResolution = density->y.value() / density->millimetres();
}

// A profile tells what colours it is for.
bool suits(const Bytes& profile, ColorModel model) {
    constexpr std::size_t head = 128;
    const bool grey = model == ColorModel::Grey || model == ColorModel::GreyAlpha;
    const std::string_view text = asText(profile);
    return text.size() > head && text.substr(36, 4) == "acsp" &&
           text.substr(16, 4) == (grey ? "GRAY" : "RGB ");
}

// One that stands in a PNG as a text counts where none stands in its place.
void takeProfile(Photograph& photograph, const Bytes& profile) {
    if (profile.empty() || profile == photograph.iccProfile)
        return;
    if (!photograph.iccProfile.empty())
        photograph.unheld.emplace_back("a second ICC profile");
    else if (suits(profile, photograph.model))
        photograph.iccProfile = profile;
    else
        photograph.unheld.emplace_back(kUnsuitedProfile);
}

Photograph read(const Bytes& file, FileFormat format, const fs::path& path, const ReadLimits& limits) {
    switch (format) {
    case FileFormat::Jpeg:
        return readJpeg(file, path, limits);
    case FileFormat::Heif:
        return readHeif(file, path, limits);
    case FileFormat::Psd:
        return readPsd(file, path, limits);
    default:
        return decodeFile(file, format, path, limits);
    }
}

} // namespace

PhotographReader::PhotographReader(const fs::path& path, const ReadOptions& options)
    : mOptions(options), mFile(std::make_unique<SourceFile>(path)) {
    if (mFile->size() == 0)
        refuse(path, "the file is empty", kCopyAgain);
    const Bytes head = mFile->read(0, std::min(mFile->size(), kHeadBytes));
    if (isCameraRaw(head))
        refuseCameraRaw(path);
    const std::optional<FileFormat> format = formatOfContent(head);
    if (!format)
        refuse(path, "is not a picture of a known kind",
               "JPEG, PNG, TIFF, WebP, PSD and HEIF files can be read");
    mFormat = *format;
    if (mFormat != FileFormat::Tiff)
        return;
    mTiff = std::make_unique<TiffFile>(*mFile, options.firstOnly ? 1 : TiffFile::kAll);
    if (mTiff->isCameraRaw())
        refuseCameraRaw(path);
    mPages = mTiff->pages();
}

PhotographReader::~PhotographReader() = default;

Photograph PhotographReader::next() {
    Photograph photograph = mTiff ? readTiffPage(*mFile, *mTiff, mNext, mOptions.limits) : readOther();
    photograph.source = mFile->path();
    photograph.encoding.format = mFormat;
    photograph.pages = mPages;
    photograph.page = mNext++;
    if (mTiff && mTiff->hasMore())
        photograph.unheld.emplace_back("the other pages");
    takeResolution(photograph);
    return photograph;
}

Photograph PhotographReader::readOther() {
    checkFileSize(mFile->size(), mFile->path(), mOptions.limits);
    const Bytes file = mFile->read(0, mFile->size());
    const int frames = framesOf(mFile->path(), file, mFormat, mOptions.firstOnly);
    Photograph photograph = read(file, mFormat, mFile->path(), mOptions.limits);
    if (frames > 1)
        photograph.unheld.push_back(frames > 2 ? "the other " + std::to_string(frames - 1) + " frames"
                                               : "the other frame");
    photograph.metadata = std::make_shared<const Metadata>(readMetadata(file, mFormat));
    takeProfile(photograph, photograph.metadata->iccProfile);
    return photograph;
}

Photograph readPhotograph(const fs::path& path, const ReadOptions& options) {
    return PhotographReader(path, options).next();
}

} // namespace orvela
