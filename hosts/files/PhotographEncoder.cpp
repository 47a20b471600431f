#include "files/PhotographEncoder.h"

#include "files/Vips.h"

namespace orvela {

namespace {

namespace fs = std::filesystem;

constexpr Bytes::value_type kExifHead[] = {'E', 'x', 'i', 'f', 0, 0};

struct GFree {
    void operator()(void* data) const { g_free(data); }
};

void attach(VipsImage* image, const char* field, const Bytes& bytes) {
    if (!bytes.empty())
        vips_image_set_blob_copy(image, field, bytes.data(), bytes.size());
}

// The source's settings where it has the target's format, the given ones before all.
Encoding settingsFor(const Photograph& photograph, FileFormat format, const fs::path& target,
                     const WriteOptions& options) {
    Encoding settings;
    settings.chromaSubsampled = false;
    if (photograph.encoding.format == format)
        settings = photograph.encoding;
    if (options.quality > 0)
        settings.quality = options.quality;
    if (settings.quality == 0)
        settings.quality = format == FileFormat::WebP || format == FileFormat::Heif ? 90 : 92;
    settings.chromaSubsampled = options.chromaSubsampled.value_or(settings.chromaSubsampled);
    settings.lossless = options.lossless.value_or(settings.lossless);
    settings.progressive = options.progressive.value_or(settings.progressive);
    if (format == FileFormat::Heif)
        settings.compression = target.extension() == ".avif"   ? "av1"
                               : settings.compression == "av1" ? "av1"
                                                               : "hevc";
    return settings;
}

int save(VipsImage* image, const Photograph& photograph, FileFormat format, const Encoding& settings,
         void** data, std::size_t* size) {
    const VipsForeignSubsample chroma =
        settings.chromaSubsampled ? VIPS_FOREIGN_SUBSAMPLE_ON : VIPS_FOREIGN_SUBSAMPLE_OFF;
    switch (format) {
    case FileFormat::Jpeg:
        return vips_jpegsave_buffer(image, data, size, "Q", settings.quality, "subsample_mode", chroma,
                                    "interlace", settings.progressive, "optimize_coding", TRUE, nullptr);
    case FileFormat::Png:
        return vips_pngsave_buffer(image, data, size, "interlace", settings.progressive, nullptr);
    case FileFormat::WebP:
        return vips_webpsave_buffer(image, data, size, "Q", settings.quality, "lossless", settings.lossless,
                                    "alpha_q", 100, nullptr);
    case FileFormat::Heif:
        return vips_heifsave_buffer(image, data, size, "Q", settings.quality, "subsample_mode", chroma,
                                    "bitdepth", photograph.depth == 8 ? 8 : settings.bitDepth, "compression",
                                    settings.compression == "av1" ? VIPS_FOREIGN_HEIF_COMPRESSION_AV1
                                                                  : VIPS_FOREIGN_HEIF_COMPRESSION_HEVC,
                                    nullptr);
    case FileFormat::Tiff: // see TiffWriter
    case FileFormat::Psd:  // refused by formatObstacle
        break;
    }
    return -1;
}

void stopWhenAsked(VipsImage* image, VipsProgress*, void* stop) {
    if (*static_cast<const std::atomic<bool>*>(stop))
        vips_image_set_kill(image, TRUE);
}

bool isAsked(const std::atomic<bool>* stop) {
    return stop != nullptr && *stop;
}

} // namespace

Bytes encodePhotograph(const Photograph& photograph, FileFormat format, const fs::path& target,
                       const WriteOptions& options, const Metadata& metadata) {
    startVips();
    vips_error_clear();
    const VipsHandle image = vipsImage(photograph);
    if (format == FileFormat::Heif) {
        Bytes exif = metadata.exif;
        if (!exif.empty())
            exif.insert(exif.begin(), std::begin(kExifHead), std::end(kExifHead));
        attach(image.get(), VIPS_META_EXIF_NAME, exif);
        attach(image.get(), VIPS_META_XMP_NAME, metadata.xmp);
    }
    if (options.stop != nullptr) {
        vips_image_set_progress(image.get(), TRUE);
        g_signal_connect(image.get(), "eval", G_CALLBACK(stopWhenAsked),
                         const_cast<std::atomic<bool>*>(options.stop));
    }
    void* data = nullptr;
    std::size_t size = 0;
    const Encoding settings = settingsFor(photograph, format, target, options);
    const int failed = save(image.get(), photograph, format, settings, &data, &size);
    const std::unique_ptr<void, GFree> owner(data);
    if (isAsked(options.stop))
        throw StoppedError(target.string() + ": stopped; nothing was written");
    if (failed != 0)
        throw PhotographError(target.string() + ": " + formatName(format) + " encoding failed (" +
                              takeVipsError() + "); choose other settings or another format");
    const auto* bytes = static_cast<const std::uint8_t*>(data);
    return {bytes, bytes + size};
}

} // namespace orvela
