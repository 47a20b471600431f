#include "files/HeifReader.h"

#include "files/ChildProcess.h"
#include "files/HeifBoxes.h"
#include "files/HeifRate.h"
#include "files/Memory.h"
#include "files/Refusal.h"
#include "metadata/HeifLibrary.h"

#include <algorithm>
#include <cstring>

namespace orvela {

namespace {

namespace fs = std::filesystem;

// What decoding takes beside the result at the most.
constexpr std::uint64_t kDecoderBytesPerPixel = 32;
constexpr std::uint64_t kDecoderBytes = 100'000'000;

/// What the child sends first; profile and samples follow once it has decoded them.
struct Head {
    std::int32_t width;
    std::int32_t height;
    std::int32_t bits;
    std::int32_t hasAlpha;
    std::uint64_t profileSize;
};

/// The file in the hands of the library; lives in the child.
class Decoder {
public:
    explicit Decoder(ByteView file) : mContext(heif_context_alloc()) {
        checkHeif(
            heif_context_read_from_memory_without_copy(mContext.get(), file.data(), file.size(), nullptr));
        heif_image_handle* handle = nullptr;
        checkHeif(heif_context_get_primary_image_handle(mContext.get(), &handle));
        mHandle.reset(handle);
    }

    void send(const ChildProcess::Sink& sink) const;

private:
    Bytes profile() const;
    HeifImage decoded(const Head& head) const;
    void sendRows(const ChildProcess::Sink& sink, const Head& head, heif_image* image) const;

    HeifContext mContext;
    HeifHandle mHandle;
};

// The colours of RGB with a transparency that is multiplied in.
template <typename Sample>
void divideByAlpha(Sample* samples, std::size_t count, unsigned most) {
    for (std::size_t i = 0; i < count; ++i)
        if (const unsigned alpha = samples[i | 3]; i % 4 != 3 && alpha > 0)
            samples[i] = static_cast<Sample>(std::min(most, (samples[i] * most + alpha / 2) / alpha));
}

Bytes Decoder::profile() const {
    const heif_color_profile_type type = heif_image_handle_get_color_profile_type(mHandle.get());
    if (type != heif_color_profile_type_prof && type != heif_color_profile_type_rICC)
        return {};
    Bytes profile(heif_image_handle_get_raw_color_profile_size(mHandle.get()));
    checkHeif(heif_image_handle_get_raw_color_profile(mHandle.get(), profile.data()));
    return profile;
}

void Decoder::send(const ChildProcess::Sink& sink) const {
    const Bytes icc = profile();
    const Head head{heif_image_handle_get_width(mHandle.get()), heif_image_handle_get_height(mHandle.get()),
                    heif_image_handle_get_luma_bits_per_pixel(mHandle.get()),
                    heif_image_handle_has_alpha_channel(mHandle.get()), icc.size()};
    sink.send(head);
    const HeifImage image = decoded(head);
    sink.send(icc.data(), icc.size());
    sendRows(sink, head, image.get());
}

HeifImage Decoder::decoded(const Head& head) const {
    heif_image* decoded = nullptr;
    checkHeif(heif_decode_image(mHandle.get(), &decoded, heif_colorspace_RGB,
                                interleavedChroma(head.bits > 8, head.hasAlpha != 0), nullptr));
    HeifImage image(decoded);
    if (heif_image_get_width(decoded, heif_channel_interleaved) != head.width ||
        heif_image_get_height(decoded, heif_channel_interleaved) != head.height)
        throw std::runtime_error("the picture has other dimensions than the file says");
    return image;
}

void Decoder::sendRows(const ChildProcess::Sink& sink, const Head& head, heif_image* image) const {
    const bool deep = head.bits > 8;
    int stride = 0;
    std::uint8_t* plane = heif_image_get_plane(image, heif_channel_interleaved, &stride);
    const bool multiplied =
        head.hasAlpha != 0 && heif_image_handle_is_premultiplied_alpha(mHandle.get()) != 0;
    std::vector<std::uint16_t> row(static_cast<std::size_t>(head.width) * (head.hasAlpha != 0 ? 4 : 3));
    for (int y = 0; y < head.height; ++y) {
        std::uint8_t* line = plane + static_cast<std::ptrdiff_t>(y) * stride;
        if (!deep) {
            if (multiplied)
                divideByAlpha(line, row.size(), 255);
            sink.send(line, row.size());
            continue;
        }
        std::memcpy(row.data(), line, row.size() * 2);
        if (multiplied)
            divideByAlpha(row.data(), row.size(), (1U << head.bits) - 1);
        // Repeating the high bits below the low ones makes full scale 65535.
        for (std::uint16_t& sample : row)
            sample = static_cast<std::uint16_t>(sample << (16 - head.bits) | sample >> (2 * head.bits - 16));
        sink.send(row.data(), row.size() * 2);
    }
}

void takeCoding(Photograph& photograph, const std::optional<HeifCoding>& coding) {
    photograph.encoding.compression = coding && coding->isAv1 ? "av1" : "hevc";
    photograph.encoding.chroma = coding ? coding->chroma : Chroma::Half;
    if (!coding)
        return;
    photograph.encoding.lossless = coding->lossless;
    for (const std::string& property : coding->otherProperties)
        photograph.unheld.push_back("the HEIF property " + property);
    const double pixels = static_cast<double>(photograph.width) * photograph.height;
    photograph.encoding.heifRate = std::make_shared<const HeifRate>(
        HeifRate{heifSample(photograph), static_cast<double>(coding->bytes) / pixels});
}

Photograph receive(ChildProcess& child, ByteView file, const fs::path& path, const ReadLimits& limits,
                   std::uint64_t& pixels) {
    const std::optional<HeifCoding> coding = heifCoding(file);
    const Head head = child.receive<Head>();
    Photograph photograph;
    photograph.source = path;
    photograph.width = head.width;
    photograph.height = head.height;
    pixels = static_cast<std::uint64_t>(head.width) * static_cast<std::uint64_t>(head.height);
    if (head.bits < 8 || head.bits > 16)
        refuse(path, "has an unknown number of bits per sample", "save it with 8, 10 or 12 bits");
    photograph.depth = head.bits > 8 ? 16 : 8;
    photograph.model = head.hasAlpha != 0 ? ColorModel::RgbAlpha : ColorModel::Rgb;
    // Measured with all kinds of chroma, HEVC and AV1.
    const std::uint64_t decoderBytes = sampleBytes(photograph) * (photograph.depth == 16 ? 5 : 3);
    checkPicture({head.width, head.height, sampleBytes(photograph), file.size(),
                  coding ? coding->mostPixelsPerByte : bounds::kNone, decoderBytes},
                 path, limits);
    photograph.encoding.format = FileFormat::Heif;
    photograph.encoding.bitDepth = head.bits;
    photograph.iccProfile.resize(head.profileSize);
    child.receive(photograph.iccProfile.data(), head.profileSize);
    photograph.samples.resize(pixels * sampleBytes(photograph));
    child.receive(photograph.samples.data(), photograph.samples.size());
    takeCoding(photograph, coding);
    return photograph;
}

} // namespace

Photograph readHeif(ByteView file, const fs::path& path, const ReadLimits& limits) {
    std::uint64_t pixels = 0;
    try {
        ChildProcess child([&](const ChildProcess::Sink& sink) { Decoder(file).send(sink); });
        return receive(child, file, path, limits, pixels);
    } catch (const ChildFailure& failure) {
        // The decoder has no words of its own for want of memory.
        if (kDecoderBytes + pixels * kDecoderBytesPerPixel > obtainableMemory())
            throw std::bad_alloc();
        refuseUnread(path, failure.what());
    }
}

} // namespace orvela
