#include "files/PhotographEncoder.h"

#include "files/Conversion.h"
#include "files/HeifEncoder.h"
#include "files/JpegEncoder.h"
#include "files/Memory.h"
#include "files/Vips.h"

#include <new>

namespace orvela {

namespace {

namespace fs = std::filesystem;

// What the encoders take at the most, lossless WebP most of all; what they say does not tell want of memory.
constexpr std::uint64_t kEncoderBytesPerPixel = 64;

struct GFree {
    void operator()(void* data) const { g_free(data); }
};

// The source's settings where it has the target's format, the given ones before all.
Encoding settingsFor(const Photograph& photograph, FileFormat format, const WriteOptions& options) {
    Encoding settings;
    if (photograph.encoding.format == format)
        settings = photograph.encoding;
    settings.lossless = options.lossless.value_or(settings.lossless);
    settings.progressive = options.progressive.value_or(settings.progressive);
    return settings;
}

int save(VipsImage* image, const Photograph& photograph, FileFormat format, const WriteOptions& options,
         void** data, std::size_t* size) {
    const Encoding settings = settingsFor(photograph, format, options);
    const auto quality = [&](int otherwise) { return options.quality > 0 ? options.quality : otherwise; };
    switch (format) {
    case FileFormat::Png:
        return vips_pngsave_buffer(image, data, size, "interlace", settings.progressive, nullptr);
    case FileFormat::WebP:
        return vips_webpsave_buffer(image, data, size, "Q", quality(90), "lossless", settings.lossless,
                                    "alpha_q", 100, nullptr);
    case FileFormat::Jpeg: // these have encoders of their own
    case FileFormat::Heif:
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

Bytes encodeWithVips(const Photograph& photograph, FileFormat format, const fs::path& target,
                     const WriteOptions& options) {
    startVips();
    vips_error_clear();
    const VipsHandle image = vipsImage(photograph);
    if (options.stop != nullptr) {
        vips_image_set_progress(image.get(), TRUE);
        g_signal_connect(image.get(), "eval", G_CALLBACK(stopWhenAsked),
                         const_cast<std::atomic<bool>*>(options.stop));
    }
    void* data = nullptr;
    std::size_t size = 0;
    const int failed = save(image.get(), photograph, format, options, &data, &size);
    const std::unique_ptr<void, GFree> owner(data);
    if (isAsked(options.stop))
        throw StoppedError(target.string() + ": stopped; nothing was written");
    const auto pixels =
        static_cast<std::uint64_t>(photograph.width) * static_cast<std::uint64_t>(photograph.height);
    if (failed != 0 && obtainableMemory() < pixels * kEncoderBytesPerPixel)
        throw std::bad_alloc();
    if (failed != 0)
        throw PhotographError(target.string() + ": " + formatName(format) + " encoding failed (" +
                              takeVipsError() + "); choose other settings or another format");
    const auto* bytes = static_cast<const std::uint8_t*>(data);
    return {bytes, bytes + size};
}

} // namespace

std::uint64_t encoderBytes(const Photograph& photograph, FileFormat format, const fs::path& target,
                           const WriteOptions& options) {
    const auto pixels =
        static_cast<std::uint64_t>(photograph.width) * static_cast<std::uint64_t>(photograph.height);
    const std::uint64_t samples = photograph.samples.size();
    const std::uint64_t changed = changesSamples(conversionFor(format, photograph)) ? samples : 0;
    switch (format) {
    case FileFormat::Heif:
        return changed + heifEncoderBytes(photograph, target);
    case FileFormat::WebP:
        return changed + pixels * (settingsFor(photograph, format, options).lossless ? 32 : 8);
    case FileFormat::Jpeg:
        return changed + pixels * 8;
    case FileFormat::Png: // the bytes of the file are held several times, those of noise are many
        return changed + samples * 4;
    default:
        return changed; // a TIFF is written strip by strip
    }
}

Bytes encodePhotograph(const Photograph& photograph, FileFormat format, const fs::path& target,
                       const WriteOptions& options, const Metadata& metadata) {
    switch (format) {
    case FileFormat::Jpeg:
        return encodeJpeg(photograph, target, options);
    case FileFormat::Heif:
        return encodeHeif(photograph, target, options, metadata);
    default:
        return encodeWithVips(photograph, format, target, options);
    }
}

} // namespace orvela
