#include "files/HeifEncoder.h"

#include "files/ChildProcess.h"
#include "files/Conversion.h"
#include "files/HeifBoxes.h"
#include "files/HeifRate.h"
#include "files/Memory.h"
#include "metadata/ExifBlock.h"
#include "metadata/HeifLibrary.h"

#include <algorithm>
#include <array>
#include <cstring>

namespace orvela {

namespace {

namespace fs = std::filesystem;

using HeifEncoder = HeifPointer<heif_encoder, heif_encoder_release>;
using HeifColors = HeifPointer<heif_color_profile_nclx, heif_nclx_color_profile_free>;
using HeifEncodingOptions = HeifPointer<heif_encoding_options, heif_encoding_options_free>;

constexpr int kQuality = 90;
constexpr int kLosslessQuality = 100;
constexpr int kAv1Speed = 5; // of 0 to 9

// What encoding takes beside the picture at the most.
constexpr std::uint64_t kEncoderBytesPerPixel = 64;
constexpr std::uint64_t kEncoderBytes = 200'000'000;

struct Settings {
    bool isAv1 = false;
    Chroma chroma = Chroma::Full;
    int bitDepth = 8;
    int quality = 0;
    bool lossless = false; ///< whatever the quality
    int orientation = 1;   ///< as Exif counts
    std::optional<ColorCodes> colors;
};

bool isAv1(const Photograph& photograph, const fs::path& target) {
    const Encoding& source = photograph.encoding;
    const bool known = source.format == FileFormat::Heif;
    return heifCodec(target).value_or(known ? source.compression : "hevc") == "av1";
}

Settings settingsFor(const Photograph& photograph, const fs::path& target, const WriteOptions& options,
                     const Metadata& metadata) {
    const Encoding& source = photograph.encoding;
    const bool known = source.format == FileFormat::Heif;
    Settings settings;
    settings.isAv1 = isAv1(photograph, target);
    settings.orientation = ExifBlock(metadata.exif).orientation();
    settings.colors = metadata.colors;
    settings.chroma = known ? source.chroma : Chroma::Full;
    if (options.chromaSubsampled)
        settings.chroma = *options.chromaSubsampled ? Chroma::Half : Chroma::Full;
    if (photograph.depth == 16)
        settings.bitDepth = heifBitDepth(photograph);
    settings.quality = options.quality;
    settings.lossless = known && source.lossless && options.quality == 0;
    return settings;
}

HeifImage imageOf(const Photograph& photograph, int bitDepth) {
    const bool deep = bitDepth > 8;
    heif_image* created = nullptr;
    checkHeif(heif_image_create(photograph.width, photograph.height, heif_colorspace_RGB,
                                interleavedChroma(deep, photograph.model == ColorModel::RgbAlpha), &created));
    HeifImage image(created);
    checkHeif(heif_image_add_plane(created, heif_channel_interleaved, photograph.width, photograph.height,
                                   bitDepth));
    int stride = 0;
    std::uint8_t* plane = heif_image_get_plane(created, heif_channel_interleaved, &stride);
    const std::size_t count = static_cast<std::size_t>(photograph.width * samplesPerPixel(photograph.model));
    std::vector<std::uint16_t> row(count);
    for (int y = 0; y < photograph.height; ++y) {
        std::uint8_t* line = plane + static_cast<std::ptrdiff_t>(y) * stride;
        const std::size_t first = static_cast<std::size_t>(y) * count;
        if (!deep) {
            std::memcpy(line, photograph.samples.data() + first, count);
            continue;
        }
        std::memcpy(row.data(), photograph.samples.data() + first * 2, count * 2);
        for (std::uint16_t& sample : row)
            sample = static_cast<std::uint16_t>(sample >> (16 - bitDepth));
        std::memcpy(line, row.data(), count * 2);
    }
    return image;
}

HeifEncoder encoderFor(heif_context* context, const Settings& settings, int quality) {
    heif_encoder* created = nullptr;
    checkHeif(heif_context_get_encoder_for_format(
        context, settings.isAv1 ? heif_compression_AV1 : heif_compression_HEVC, &created));
    HeifEncoder encoder(created);
    checkHeif(heif_encoder_set_lossy_quality(created, quality));
    checkHeif(heif_encoder_set_lossless(created, settings.lossless ? 1 : 0));
    checkHeif(heif_encoder_set_parameter_string(created, "chroma",
                                                settings.chroma == Chroma::Full        ? "444"
                                                : settings.chroma == Chroma::HalfWidth ? "422"
                                                                                       : "420"));
    if (settings.isAv1)
        checkHeif(heif_encoder_set_parameter_integer(created, "speed", kAv1Speed));
    return encoder;
}

// Numbers that the library does not know are left out, which reading the file back shows. How RGB becomes
// brightness and colour is this encoder's choice.
HeifColors colorsOf(const ColorCodes& codes) {
    constexpr std::array<std::uint16_t, 3> matrices = {1, 6, 9}; // BT.709, BT.601, BT.2020
    const bool known = std::find(matrices.begin(), matrices.end(), codes.matrix) != matrices.end();
    HeifColors colors(heif_nclx_color_profile_alloc());
    if (!colors)
        throw std::bad_alloc();
    static_cast<void>(heif_nclx_color_profile_set_color_primaries(colors.get(), codes.primaries));
    static_cast<void>(heif_nclx_color_profile_set_transfer_characteristics(colors.get(), codes.transfer));
    checkHeif(
        heif_nclx_color_profile_set_matrix_coefficients(colors.get(), known ? codes.matrix : matrices[1]));
    colors->full_range_flag = 1;
    return colors;
}

void addMetadata(heif_context* context, heif_image_handle* handle, const Metadata& metadata) {
    if (!metadata.exif.empty()) {
        Bytes exif = {'E', 'x', 'i', 'f', 0, 0};
        exif.insert(exif.end(), metadata.exif.begin(), metadata.exif.end());
        checkHeif(
            heif_context_add_exif_metadata(context, handle, exif.data(), static_cast<int>(exif.size())));
    }
    if (!metadata.xmp.empty())
        checkHeif(heif_context_add_XMP_metadata(context, handle, metadata.xmp.data(),
                                                static_cast<int>(metadata.xmp.size())));
}

heif_error append(heif_context*, const void* data, std::size_t size, void* bytes) {
    const auto* first = static_cast<const std::uint8_t*>(data);
    static_cast<Bytes*>(bytes)->insert(static_cast<Bytes*>(bytes)->end(), first, first + size);
    return {heif_error_Ok, heif_suberror_Unspecified, ""};
}

Bytes encode(const Photograph& photograph, const Settings& settings, int quality, const Metadata& metadata) {
    const HeifContext context(heif_context_alloc());
    const HeifImage image = imageOf(photograph, settings.bitDepth);
    const Bytes& profile = photograph.iccProfile;
    if (!profile.empty())
        checkHeif(heif_image_set_raw_color_profile(image.get(), "prof", profile.data(), profile.size()));
    const HeifEncodingOptions encoding(heif_encoding_options_alloc());
    encoding->image_orientation = static_cast<heif_orientation>(settings.orientation);
    const HeifColors colors = settings.colors ? colorsOf(*settings.colors) : nullptr;
    if (colors) {
        checkHeif(heif_image_set_nclx_color_profile(image.get(), colors.get()));
        encoding->output_nclx_profile = colors.get();
        encoding->save_two_colr_boxes_when_ICC_and_nclx_available = 1;
        encoding->macOS_compatibility_workaround_no_nclx_profile = 0;
    }
    const HeifEncoder encoder = encoderFor(context.get(), settings, quality);
    heif_image_handle* made = nullptr;
    checkHeif(heif_context_encode_image(context.get(), image.get(), encoder.get(), encoding.get(), &made));
    const HeifHandle handle(made);
    if (metadata.heifThumbnail > 0) {
        heif_image_handle* thumbnail = nullptr; // null for a picture that is as small itself
        checkHeif(heif_context_encode_thumbnail(context.get(), image.get(), made, encoder.get(),
                                                encoding.get(), metadata.heifThumbnail, &thumbnail));
        const HeifHandle owner(thumbnail);
    }
    addMetadata(context.get(), made, metadata);
    Bytes bytes;
    heif_writer writer{1, append};
    checkHeif(heif_context_write(context.get(), &writer, &bytes));
    return bytes;
}

int qualityFor(const Photograph& photograph, const Settings& settings) {
    if (settings.quality > 0)
        return settings.quality;
    if (settings.lossless)
        return kLosslessQuality;
    const HeifRate* rate = photograph.encoding.heifRate.get();
    if (rate == nullptr)
        return kQuality;
    const double pixels = static_cast<double>(rate->sample.width) * rate->sample.height;
    return matchingQuality(rate->bytesPerPixel, [&](int quality) {
        const Bytes sample = encode(rate->sample, settings, quality, {});
        return static_cast<double>(heifCoding(sample).value().bytes) / pixels;
    });
}

} // namespace

std::uint64_t heifEncoderBytes(const Photograph& photograph, const fs::path& target) {
    const auto pixels =
        static_cast<std::uint64_t>(photograph.width) * static_cast<std::uint64_t>(photograph.height);
    const bool av1 = isAv1(photograph, target);
    const std::uint64_t each = av1 ? 40 : 28;
    const std::uint64_t ahead = av1 ? std::min<std::uint64_t>(pixels * 20, 110'000'000) : 0;
    return ahead + pixels * (photograph.depth == 16 ? each * 8 / 5 : each);
}

Bytes encodeHeif(const Photograph& photograph, const fs::path& target, const WriteOptions& options,
                 const Metadata& metadata) {
    const Settings settings = settingsFor(photograph, target, options, metadata);
    try {
        ChildProcess child([&](const ChildProcess::Sink& sink) {
            const Bytes bytes = encode(photograph, settings, qualityFor(photograph, settings), metadata);
            sink.send(bytes.size());
            sink.send(bytes.data(), bytes.size());
        });
        Bytes bytes(child.receive<std::size_t>(options.stop));
        child.receive(bytes.data(), bytes.size(), options.stop);
        return bytes;
    } catch (const ChildFailure& failure) {
        // The encoder has no words of its own for want of memory.
        if (kEncoderBytes + photograph.samples.size() / 3 * kEncoderBytesPerPixel > obtainableMemory())
            throw std::bad_alloc();
        throw PhotographError(target.string() + ": HEIF encoding failed (" + failure.what() +
                              "); choose other settings or another format");
    }
}

} // namespace orvela
