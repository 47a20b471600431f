#include "metadata/PngMetadata.h"

#include "metadata/ImageResources.h"
#include "metadata/PngTexts.h"

#include <algorithm>
#include <array>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr std::size_t kHeaderSize = 13; ///< of IHDR

void takeResources(ByteView profile, Metadata& metadata) {
    Bytes list;
    if (!startsWith(profile, "8BIM"))
        appendResource(list, resource::Iptc, profile);
    addResources(metadata.resources, list.empty() ? profile : ByteView(list));
}

void takeExif(ByteView block, Metadata& metadata) {
    takeOnce(metadata.exif, startsWith(block, "Exif\0\0"sv) ? behind(block, 6) : block, "a second Exif block",
             metadata);
}

void takeXmp(ByteView packet, Metadata& metadata) {
    takeOnce(metadata.xmp, packet, "a second XMP packet", metadata);
}

bool isExif(ByteView block) {
    if (startsWith(block, "Exif\0\0"sv))
        block = behind(block, 6);
    return startsWith(block, "II*\0"sv) || startsWith(block, "MM\0*"sv);
}

// Whether the text is a block in disguise.
bool takeProfile(const Text& text, Metadata& metadata) {
    if (!text.keyword.starts_with(kProfileKeyword))
        return false;
    const std::string kind = text.keyword.substr(kProfileKeyword.size());
    const Bytes profile = rawProfile(text.text);
    constexpr auto xmp = "http://ns.adobe.com/xap/1.0/\0"sv;
    if ((kind == "exif" || kind == "APP1") && isExif(profile))
        takeExif(profile, metadata);
    else if (kind == "xmp" || (kind == "APP1" && startsWith(profile, xmp)))
        takeXmp(kind == "xmp" ? ByteView(profile) : behind(profile, xmp.size()), metadata);
    else if (kind == "iptc" || kind == "8bim")
        takeResources(profile, metadata);
    else if (kind == "icc" || kind == "icm")
        takeOnce(metadata.iccProfile, profile, "a second ICC profile", metadata);
    else
        return false;
    return true;
}

void takeText(const PngChunk& chunk, std::size_t& room, Metadata& metadata) {
    try {
        Text text = pngText(chunk, room);
        if (text.keyword == kXmpKeyword) {
            takeXmp(asBytes(text.text), metadata);
            return;
        }
        if (takeProfile(text, metadata))
            return;
        metadata.texts.push_back(std::move(text));
    } catch (const DamagedBytes&) {
        nameOnce(metadata.damaged, "a PNG text");
    }
    metadata.chunks.push_back({std::string(chunk.name), copyOf(chunk.data)});
}

void takeDensity(ByteView data, Metadata& metadata) {
    if (data.size() != 9)
        return;
    const auto edge = [&](std::size_t at) {
        return Rational{static_cast<std::uint32_t>(number(data, at, 4, ByteOrder::Big)), 1};
    };
    const Density density{edge(0), edge(4), data[8] == 1 ? DensityUnit::Metre : DensityUnit::None};
    if (density.isMeant())
        metadata.density = density;
}

void takeColors(ByteView data, Metadata& metadata) {
    if (data.size() == 4)
        metadata.colors = ColorCodes{data[0], data[1], data[2], data[3] != 0};
}

// Chunks that describe the picture whatever becomes of its samples. The others that may stand in a file tell
// how these are stored, or belong to an animation.
bool isKept(std::string_view name) {
    constexpr std::array names = {"gAMA"sv, "cHRM"sv, "sRGB"sv, "mDCV"sv, "cLLI"sv, "tIME"sv,
                                  "bKGD"sv, "oFFs"sv, "pCAL"sv, "sCAL"sv, "sTER"sv, "sPLT"sv};
    return std::find(names.begin(), names.end(), name) != names.end();
}

bool isKnownStorage(std::string_view name) {
    constexpr std::array names = {"IHDR"sv, "PLTE"sv, "IDAT"sv, "IEND"sv, "tRNS"sv, "hIST"sv,
                                  "sBIT"sv, "iCCP"sv, "acTL"sv, "fcTL"sv, "fdAT"sv};
    return std::find(names.begin(), names.end(), name) != names.end();
}

// A background is stated in samples: not those of palettes and of less than 8 bits, which the result does not
// have.
bool suits(const Chunk& chunk, ByteView header) {
    if (chunk.name != "bKGD")
        return true;
    const bool color = header[9] % 4 >= 2;
    return header[8] >= 8 && chunk.data.size() == (color ? 6 : 2);
}

void takeKept(Chunk chunk, ByteView header, Metadata& metadata) {
    if (suits(chunk, header))
        metadata.chunks.push_back(std::move(chunk));
    else
        metadata.unheld.push_back("the PNG chunk " + chunk.name);
}

// The bits that the samples were made of; the result's fill all that there are.
void takeSignificance(ByteView bits, ByteView header, Metadata& metadata) {
    constexpr std::uint8_t palette = 3;
    const std::uint8_t depth = header[9] == palette ? std::uint8_t{8} : header[8];
    if (std::any_of(bits.begin(), bits.end(), [&](std::uint8_t bit) { return bit < depth; }))
        metadata.unheld.emplace_back("the PNG chunk sBIT");
}

void takeOther(const PngChunk& chunk, ByteView header, std::size_t& room, Metadata& metadata) {
    if (isPngText(chunk.name))
        takeText(chunk, room, metadata);
    else if (chunk.name == "pHYs")
        takeDensity(chunk.data, metadata);
    else if (chunk.name == "cICP")
        takeColors(chunk.data, metadata);
    else if (isKept(chunk.name))
        takeKept({std::string(chunk.name), copyOf(chunk.data)}, header, metadata);
    else if (chunk.name == "sBIT")
        takeSignificance(chunk.data, header, metadata);
    else if (!isKnownStorage(chunk.name))
        nameOnce(metadata.unheld, "the PNG chunk " + std::string(chunk.name));
}

Bytes densityChunk(const Density& density) {
    const double length = density.millimetres();
    const auto perMetre = [&](const Rational& value) {
        const double all = length == 0 ? value.value() : value.value() * 1000 / length;
        return static_cast<std::uint64_t>(std::clamp(all + 0.5, 0.0, 2147483647.0));
    };
    Bytes data;
    append(data, perMetre(density.x), 4, ByteOrder::Big);
    append(data, perMetre(density.y), 4, ByteOrder::Big);
    data.push_back(length == 0 ? 0 : 1);
    return data;
}

void putXmp(Bytes& file, ByteView xmp) {
    Bytes data = copyOf(asBytes(kXmpKeyword));
    append(data, 0, 5, ByteOrder::Big); // end of the keyword, not packed, no language, no translation
    append(data, xmp);
    putPngChunk(file, "iTXt", data);
}

void putMetadata(Bytes& file, const Metadata& metadata) {
    for (const Chunk& chunk : metadata.chunks)
        putPngChunk(file, chunk.name, chunk.data);
    if (metadata.format != FileFormat::Png)
        for (const Chunk& chunk : pngTexts(metadata.texts))
            putPngChunk(file, chunk.name, chunk.data);
    if (const auto& colors = metadata.colors)
        putPngChunk(
            file, "cICP",
            Bytes{static_cast<std::uint8_t>(colors->primaries), static_cast<std::uint8_t>(colors->transfer),
                  static_cast<std::uint8_t>(colors->matrix), static_cast<std::uint8_t>(colors->fullRange)});
    if (metadata.density)
        putPngChunk(file, "pHYs", densityChunk(*metadata.density));
    if (!metadata.exif.empty())
        putPngChunk(file, "eXIf", metadata.exif);
    if (!metadata.xmp.empty())
        putXmp(file, metadata.xmp);
    if (!metadata.resources.empty())
        putPngChunk(file, "zTXt", pngResources(metadata.resources).data);
}

} // namespace

Metadata readPngMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::Png;
    const std::vector<PngChunk> chunks = pngChunks(file);
    if (chunks.empty() || chunks.front().data.size() < kHeaderSize)
        return metadata; // which the reader of the picture refuses
    const ByteView header = chunks.front().data;
    std::size_t room = kMostText;
    // What has a chunk of its own goes before a text that holds it as digits.
    const auto isOwn = [](const PngChunk& chunk) {
        return chunk.name == "eXIf" || (isPngText(chunk.name) && pngKeyword(chunk) == kXmpKeyword);
    };
    for (const PngChunk& chunk : chunks)
        if (chunk.name == "eXIf")
            takeExif(chunk.data, metadata);
        else if (isOwn(chunk))
            takeText(chunk, room, metadata);
    for (const PngChunk& chunk : chunks)
        if (!isOwn(chunk))
            takeOther(chunk, header, room, metadata);
    nameRest(behindPng(file), metadata);
    return metadata;
}

void embedIntoPng(const Metadata& metadata, Bytes& encoded) {
    Bytes file = emptyPng();
    for (const PngChunk& chunk : pngChunks(encoded)) {
        if (isPngText(chunk.name) || isKept(chunk.name) || chunk.name == "pHYs" || chunk.name == "eXIf")
            continue;
        append(file, chunk.whole);
        if (chunk.name == "IHDR")
            putMetadata(file, metadata);
    }
    encoded = std::move(file);
}

bool isPlainColour(const Chunk& chunk) {
    // Primaries of sRGB in 100000ths, as most programs write them, and the exponent 1/2.2.
    constexpr auto primaries = "\0\0\x7A\x26\0\0\x80\x84\0\0\xFA\0\0\0\x80\xE8\0\0\x75\x30\0\0\xEA\x60\0\0"
                               "\x3A\x98\0\0\x17\x70"sv;
    if (chunk.name == "gAMA")
        return sameBytes(chunk.data, asBytes("\0\0\xB1\x8F"sv)) ||
               sameBytes(chunk.data, asBytes("\0\0\xB1\x8E"sv));
    return chunk.name == "sRGB" || (chunk.name == "cHRM" && sameBytes(chunk.data, asBytes(primaries)));
}

} // namespace orvela
