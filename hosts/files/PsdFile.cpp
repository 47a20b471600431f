#include "files/PsdFile.h"

#include "files/Refusal.h"
#include "metadata/ImageResources.h"
#include "metadata/PsdMetadata.h"

#include <algorithm>
#include <limits>

namespace orvela {

namespace {

namespace fs = std::filesystem;

enum Mode { Bitmap = 0, Gray = 1, Indexed = 2, RGB = 3, CMYK = 4 };

struct Header {
    std::size_t channels;
    std::size_t width;
    std::size_t height;
    int depth;
    int mode;

    std::size_t rowBytes() const { return (width * static_cast<std::size_t>(depth) + 7) / 8; }
};

Header readHeader(Cursor& cursor, const fs::path& path) {
    cursor.take(4);
    if (cursor.number(2) != 1)
        refuse(path, "is a PSB, the large form of PSD", "save it as TIFF");
    cursor.take(6);
    Header header{};
    header.channels = cursor.number(2);
    header.height = cursor.number(4);
    header.width = cursor.number(4);
    header.depth = static_cast<int>(cursor.number(2));
    header.mode = static_cast<int>(cursor.number(2));
    if (header.depth == 32)
        refuse(path, "has 32-bit float samples", "convert it to 8 or 16 bits per channel");
    if (header.mode > CMYK)
        refuse(path, "has a colour model other than grey, RGB and CMYK", "convert it to RGB, grey or CMYK");
    const std::size_t colors = header.mode == CMYK ? 4 : header.mode == RGB ? 3 : 1;
    const bool mayHaveAlpha = header.mode == RGB || header.mode == Gray;
    if (header.channels > colors + (mayHaveAlpha ? 1 : 0))
        refuse(path, "has more channels than colour and one transparency", "save it without extra channels");
    const int least = header.mode == Bitmap ? 1 : 8;
    if (header.channels < colors || (header.depth != least && (header.depth != 16 || least == 1)))
        refuse(path, "has a damaged header", kCopyAgain);
    return header;
}

void takeResources(ByteView list, Photograph& photograph, const fs::path& path) {
    const ImageResources resources = imageResources(list);
    if (const ImageResource* profile = resources.find(resource::IccProfile))
        photograph.iccProfile = copyOf(profile->data);
    const ImageResource* version = resources.find(resource::VersionInfo);
    if (version != nullptr && version->data.size() > 4 && version->data[4] == 0)
        refuse(path, "was saved without a merged picture", "save it again with maximum compatibility");
}

void unpackRow(Cursor packed, std::uint8_t* row, std::size_t size, const fs::path& path) {
    std::size_t at = 0;
    while (at < size && !packed.isAtEnd()) {
        const std::uint64_t code = packed.number(1);
        if (code == 128)
            continue;
        const std::size_t count = std::min<std::size_t>(code < 128 ? code + 1 : 257 - code, size - at);
        if (code < 128) {
            const ByteView run = packed.take(count);
            std::copy(run.begin(), run.end(), row + at);
        } else {
            std::fill_n(row + at, count, static_cast<std::uint8_t>(packed.number(1)));
        }
        at += count;
    }
    if (at < size)
        refuse(path, "holds a damaged row", kCopyAgain);
}

// All rows of the first channel, then all of the second and so on, without packing.
Bytes readPlanes(Cursor& cursor, const Header& header, const fs::path& path) {
    const std::size_t row = header.rowBytes();
    const std::size_t rows = header.height * header.channels;
    const std::uint64_t compression = cursor.number(2);
    if (compression > 1)
        refuse(path, "has its merged picture in ZIP compression", "save it as TIFF");
    if (compression == 0) {
        const ByteView plain = cursor.take(row * rows);
        return {plain.begin(), plain.end()};
    }
    Cursor lengths(cursor.take(2 * rows));
    Bytes planes(row * rows);
    for (std::size_t y = 0; y < rows; ++y)
        unpackRow(Cursor(cursor.take(lengths.number(2))), planes.data() + y * row, row, path);
    return planes;
}

void interleave(const Bytes& planes, const Header& header, Photograph& photograph) {
    const std::size_t count = header.width * header.height;
    const std::size_t bytes = static_cast<std::size_t>(header.depth) / 8;
    const std::uint8_t flip = header.mode == CMYK ? 255 : 0;
    photograph.samples.resize(planes.size());
    for (std::size_t c = 0; c < header.channels; ++c)
        for (std::size_t i = 0; i < count; ++i)
            for (std::size_t b = 0; b < bytes; ++b) {
                // The file is big-endian.
                const std::size_t from = bytes == 2 ? 1 - b : b;
                photograph.samples[(i * header.channels + c) * bytes + b] =
                    planes[(c * count + i) * bytes + from] ^ flip;
            }
}

void expandPalette(const Bytes& plane, ByteView palette, Photograph& photograph) {
    photograph.samples.reserve(plane.size() * 3);
    for (const std::uint8_t index : plane)
        for (std::size_t c = 0; c < 3; ++c)
            photograph.samples.push_back(palette[c * 256 + index]);
}

void expandBits(const Bytes& plane, const Header& header, Photograph& photograph) {
    for (std::size_t y = 0; y < header.height; ++y)
        for (std::size_t x = 0; x < header.width; ++x) {
            const bool black = plane[y * header.rowBytes() + x / 8] >> (7 - x % 8) & 1;
            photograph.samples.push_back(black ? 0 : 255);
        }
}

// The colours of a merged picture are mixed with white as far as it is transparent. Some programs do not mix
// them, which shows where one is darker than its share of white.
template <typename Sample>
void takeWhiteOut(Photograph& photograph) {
    constexpr std::int64_t full = std::numeric_limits<Sample>::max();
    const auto channels = static_cast<std::size_t>(samplesPerPixel(photograph.model));
    auto* samples = reinterpret_cast<Sample*>(photograph.samples.data());
    const std::size_t count = photograph.samples.size() / sizeof(Sample);
    const auto alphaOf = [&](std::size_t i) {
        return std::int64_t{samples[i - i % channels + channels - 1]};
    };
    for (std::size_t i = 0; i < count; ++i)
        if (samples[i] + alphaOf(i) < full - 1 && i % channels < channels - 1)
            return;
    for (std::size_t i = 0; i < count; ++i) {
        const std::int64_t alpha = alphaOf(i);
        const std::int64_t colour = std::max<std::int64_t>(samples[i] + alpha - full, 0);
        if (alpha > 0 && i % channels < channels - 1)
            samples[i] = static_cast<Sample>((colour * full + alpha / 2) / alpha);
    }
}

ColorModel modelOf(const Header& header) {
    if (header.mode == CMYK)
        return ColorModel::Cmyk;
    if (header.mode == RGB)
        return header.channels == 4 ? ColorModel::RgbAlpha : ColorModel::Rgb;
    if (header.mode == Indexed)
        return ColorModel::Rgb;
    return header.channels == 2 ? ColorModel::GreyAlpha : ColorModel::Grey;
}

// Two bytes of a packed row become at most 128.
DeclaredPicture declared(const Header& header, ByteView file) {
    const std::size_t samples = header.mode == Indexed ? 3 : header.channels;
    return {static_cast<std::int64_t>(header.width), static_cast<std::int64_t>(header.height),
            samples * (header.depth == 16 ? 2 : 1), file.size(), 64.0 * 8 / header.depth};
}

Photograph read(ByteView file, const fs::path& path, const ReadLimits& limits) {
    Cursor cursor(file);
    const Header header = readHeader(cursor, path);
    checkPicture(declared(header, file), path, limits);
    const ByteView palette = cursor.block();
    if (header.mode == Indexed && palette.size() < 768)
        refuse(path, "has a damaged palette", kCopyAgain);
    Photograph photograph;
    photograph.source = path;
    photograph.width = static_cast<int>(header.width);
    photograph.height = static_cast<int>(header.height);
    photograph.depth = header.depth == 16 ? 16 : 8;
    photograph.model = modelOf(header);
    photograph.encoding.format = FileFormat::Psd;
    takeResources(cursor.block(), photograph, path);
    const PsdLayers layers = psdLayers(cursor.block());
    photograph.extraChannel = hasAlpha(photograph.model) && !layers.transparency;
    const Bytes planes = readPlanes(cursor, header, path);
    if (!cursor.isAtEnd())
        photograph.unheld.push_back(std::to_string(cursor.rest().size()) + " bytes behind the picture");
    if (header.mode == Indexed) {
        expandPalette(planes, palette, photograph);
        photograph.notes.emplace_back(kPaletteNote);
    } else if (header.depth == 1) {
        expandBits(planes, header, photograph);
        photograph.notes.emplace_back(kBitsNote);
    } else {
        interleave(planes, header, photograph);
    }
    if (hasAlpha(photograph.model) && layers.transparency)
        photograph.depth == 16 ? takeWhiteOut<std::uint16_t>(photograph)
                               : takeWhiteOut<std::uint8_t>(photograph);
    return photograph;
}

} // namespace

Photograph readPsd(ByteView file, const fs::path& path, const ReadLimits& limits) {
    try {
        return read(file, path, limits);
    } catch (const DamagedBytes&) {
        refuse(path, "the file is cut short", kCopyAgain);
    }
}

} // namespace orvela
