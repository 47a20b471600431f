#include "metadata/PngMetadata.h"

#include "metadata/ImageResources.h"
#include "metadata/Utf8.h"

#include <zlib.h>

#include <algorithm>
#include <array>
#include <cctype>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr auto kSignature = "\x89PNG\r\n\x1A\n"sv;
constexpr auto kXmpKeyword = "XML:com.adobe.xmp"sv;
constexpr auto kProfileKeyword = "Raw profile type "sv;
constexpr std::size_t kHead = 8; ///< length and name
constexpr std::size_t kSum = 4;
constexpr std::size_t kHeaderSize = 13; ///< of IHDR
constexpr std::size_t kLongestKeyword = 79;

struct RawChunk {
    std::string_view name;
    ByteView data;
    ByteView whole;
};

// As far as they are whole.
std::vector<RawChunk> chunksOf(ByteView file) {
    std::vector<RawChunk> chunks;
    for (std::size_t at = kSignature.size(); at + kHead + kSum <= file.size();) {
        const std::size_t size = number(file, at, 4, ByteOrder::Big);
        if (size > file.size() - at - kHead - kSum)
            break;
        chunks.push_back({asText(file.subspan(at + 4, 4)), file.subspan(at + kHead, size),
                          file.subspan(at, kHead + size + kSum)});
        at += kHead + size + kSum;
    }
    return chunks;
}

// A small chunk may claim to hold any amount.
Bytes inflated(ByteView packed) {
    constexpr std::size_t most = std::size_t{64} << 20;
    z_stream stream{};
    if (inflateInit(&stream) != Z_OK)
        throw DamagedBytes("it cannot be unpacked");
    Bytes plain;
    stream.next_in = const_cast<Bytef*>(packed.data());
    stream.avail_in = static_cast<uInt>(packed.size());
    int state = Z_OK;
    while (state == Z_OK && plain.size() < most) {
        std::array<std::uint8_t, 16384> piece{};
        stream.next_out = piece.data();
        stream.avail_out = piece.size();
        state = inflate(&stream, Z_NO_FLUSH);
        append(plain, ByteView(piece).first(piece.size() - stream.avail_out));
    }
    inflateEnd(&stream);
    if (state != Z_STREAM_END)
        throw DamagedBytes("it cannot be unpacked");
    return plain;
}

Bytes deflated(ByteView plain) {
    uLongf size = compressBound(plain.size());
    Bytes packed(size);
    if (compress2(packed.data(), &size, plain.data(), plain.size(), 9) != Z_OK)
        throw std::bad_alloc();
    packed.resize(size);
    return packed;
}

// Up to the next zero, which is taken too.
std::string_view word(ByteView& data) {
    const auto end = std::find(data.begin(), data.end(), 0);
    if (end == data.end())
        throw DamagedBytes("a text has no end");
    const auto size = static_cast<std::size_t>(end - data.begin());
    const std::string_view text = asText(data.first(size));
    data = behind(data, size + 1);
    return text;
}

ByteView from(ByteView data, std::size_t at) {
    return slice(data, at, data.size() - std::min(at, data.size()));
}

Text textOf(const RawChunk& chunk) {
    ByteView data = chunk.data;
    Text text{latinToUtf8(asBytes(word(data))), {}};
    if (chunk.name == "tEXt")
        text.text = latinToUtf8(data);
    else if (chunk.name == "zTXt")
        text.text = latinToUtf8(inflated(from(data, 1)));
    else {
        const bool packed = number(data, 0, 1, ByteOrder::Big) != 0;
        data = from(data, 2);
        word(data); // language
        word(data); // keyword in that language
        text.text = packed ? std::string(asText(inflated(data))) : std::string(asText(data));
    }
    return text;
}

// What programs put into a text as hexadecimal digits, behind a name and a number of bytes.
Bytes profileOf(const std::string& text) {
    Bytes bytes;
    std::size_t at = text.find_first_not_of('\n');
    for (int line = 0; line < 2 && at != std::string::npos; ++line) {
        at = text.find('\n', at);
        at = at == std::string::npos ? at : at + 1;
    }
    int digits = 0;
    unsigned value = 0;
    for (; at < text.size(); ++at) {
        const auto c = static_cast<unsigned char>(text[at]);
        if (std::isxdigit(c) == 0)
            continue;
        value = value << 4 | static_cast<unsigned>(c <= '9' ? c - '0' : (c | 0x20) - 'a' + 10);
        if (++digits % 2 == 0)
            bytes.push_back(static_cast<std::uint8_t>(value));
    }
    return bytes;
}

void takeResources(ByteView profile, Metadata& metadata) {
    if (startsWith(profile, "8BIM"))
        append(metadata.resources, profile);
    else
        appendResource(metadata.resources, resource::Iptc, profile);
}

// Whether the text is a block in disguise.
bool takeProfile(const Text& text, Metadata& metadata) {
    if (!text.keyword.starts_with(kProfileKeyword))
        return false;
    const std::string kind = text.keyword.substr(kProfileKeyword.size());
    const Bytes profile = profileOf(text.text);
    ByteView exif = profile;
    if (startsWith(exif, "Exif\0\0"sv))
        exif = behind(exif, 6);
    constexpr auto xmp = "http://ns.adobe.com/xap/1.0/\0"sv;
    if ((kind == "exif" || kind == "APP1") && (startsWith(exif, "II*\0"sv) || startsWith(exif, "MM\0*"sv))) {
        if (metadata.exif.empty())
            metadata.exif = copyOf(exif);
    } else if (kind == "xmp" || (kind == "APP1" && startsWith(profile, xmp))) {
        if (metadata.xmp.empty())
            metadata.xmp = copyOf(kind == "xmp" ? ByteView(profile) : behind(profile, xmp.size()));
    } else if (kind == "iptc" || kind == "8bim") {
        if (metadata.resources.empty())
            takeResources(profile, metadata);
    } else {
        return kind == "icc" || kind == "icm";
    }
    return true;
}

void takeText(const RawChunk& chunk, Metadata& metadata) {
    try {
        Text text = textOf(chunk);
        if (text.keyword == kXmpKeyword) {
            metadata.xmp = copyOf(asBytes(text.text));
            return;
        }
        if (takeProfile(text, metadata))
            return;
        metadata.texts.push_back(std::move(text));
    } catch (const DamagedBytes&) {
        metadata.damaged.emplace_back("a PNG text");
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

bool isText(std::string_view name) {
    return name == "tEXt" || name == "zTXt" || name == "iTXt";
}

// A background is stated in samples: not those of palettes and of less than 8 bits, which the result does not
// have.
bool suits(const Chunk& chunk, ByteView header) {
    if (chunk.name != "bKGD")
        return true;
    const bool color = header[9] % 4 >= 2;
    return header[8] >= 8 && chunk.data.size() == (color ? 6 : 2);
}

void takeChunk(Chunk chunk, ByteView header, Metadata& metadata) {
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

void put(Bytes& file, std::string_view name, ByteView data) {
    append(file, data.size(), 4, ByteOrder::Big);
    const std::size_t at = file.size();
    append(file, name);
    append(file, data);
    const ByteView summed = ByteView(file).subspan(at);
    append(file, crc32(0, summed.data(), static_cast<uInt>(summed.size())), 4, ByteOrder::Big);
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
    put(file, "iTXt", data);
}

// As most programs write IPTC, too: the list of resources that it stands in.
void putResources(Bytes& file, ByteView resources) {
    constexpr auto digits = "0123456789abcdef"sv;
    std::string text = "\niptc\n";
    const std::string size = std::to_string(resources.size());
    text += std::string(8 - std::min<std::size_t>(8, size.size()), ' ') + size;
    for (std::size_t i = 0; i < resources.size(); ++i) {
        if (i % 36 == 0)
            text += '\n';
        text += digits[resources[i] >> 4];
        text += digits[resources[i] & 15];
    }
    text += '\n';
    Bytes data = copyOf(asBytes("Raw profile type iptc"sv));
    append(data, 0, 2, ByteOrder::Big); // end of the keyword, deflated
    append(data, deflated(asBytes(text)));
    put(file, "zTXt", data);
}

void putMetadata(Bytes& file, const Metadata& metadata) {
    for (const Chunk& chunk : metadata.chunks)
        put(file, chunk.name, chunk.data);
    if (metadata.format != FileFormat::Png)
        for (const Chunk& chunk : pngTexts(metadata.texts))
            put(file, chunk.name, chunk.data);
    if (const auto& colors = metadata.colors)
        put(file, "cICP",
            Bytes{static_cast<std::uint8_t>(colors->primaries), static_cast<std::uint8_t>(colors->transfer),
                  static_cast<std::uint8_t>(colors->matrix), static_cast<std::uint8_t>(colors->fullRange)});
    if (metadata.density)
        put(file, "pHYs", densityChunk(*metadata.density));
    if (!metadata.exif.empty())
        put(file, "eXIf", metadata.exif);
    if (!metadata.xmp.empty())
        putXmp(file, metadata.xmp);
    if (!metadata.resources.empty())
        putResources(file, metadata.resources);
}

} // namespace

Metadata readPngMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::Png;
    const std::vector<RawChunk> chunks = chunksOf(file);
    if (chunks.empty() || chunks.front().data.size() < kHeaderSize)
        return metadata; // which the reader of the picture refuses
    const ByteView header = chunks.front().data;
    // The chunk for Exif goes before a text that holds one.
    for (const RawChunk& chunk : chunks)
        if (chunk.name == "eXIf" && metadata.exif.empty())
            metadata.exif = copyOf(startsWith(chunk.data, "Exif\0\0"sv) ? behind(chunk.data, 6) : chunk.data);
    for (const RawChunk& chunk : chunks) {
        if (isText(chunk.name))
            takeText(chunk, metadata);
        else if (chunk.name == "pHYs")
            takeDensity(chunk.data, metadata);
        else if (chunk.name == "cICP")
            takeColors(chunk.data, metadata);
        else if (isKept(chunk.name))
            takeChunk({std::string(chunk.name), copyOf(chunk.data)}, header, metadata);
        else if (chunk.name == "sBIT")
            takeSignificance(chunk.data, header, metadata);
        else if (chunk.name != "eXIf" && !isKnownStorage(chunk.name))
            metadata.unheld.push_back("the PNG chunk " + std::string(chunk.name));
    }
    return metadata;
}

void embedIntoPng(const Metadata& metadata, Bytes& encoded) {
    Bytes file = copyOf(asBytes(kSignature));
    for (const RawChunk& chunk : chunksOf(encoded)) {
        if (isText(chunk.name) || isKept(chunk.name) || chunk.name == "pHYs" || chunk.name == "eXIf")
            continue;
        append(file, chunk.whole);
        if (chunk.name == "IHDR")
            putMetadata(file, metadata);
    }
    encoded = std::move(file);
}

bool hasPngChunk(ByteView file, std::string_view name) {
    const std::vector<RawChunk> chunks = chunksOf(file);
    return std::any_of(chunks.begin(), chunks.end(), [&](const RawChunk& one) { return one.name == name; });
}

int pngFrames(ByteView file) {
    std::uint64_t frames = 0;
    bool isFrame = false; // the picture for readers that do not know animations
    for (const RawChunk& chunk : chunksOf(file)) {
        if (chunk.name == "IDAT")
            break;
        if (chunk.name == "acTL" && chunk.data.size() >= 4)
            frames = number(chunk.data, 0, 4, ByteOrder::Big);
        isFrame = isFrame || chunk.name == "fcTL";
    }
    const int shown = static_cast<int>(std::min<std::uint64_t>(frames, INT32_MAX));
    return shown == 0 ? 1 : std::max(shown, isFrame ? 1 : 2);
}

std::vector<Chunk> pngTexts(const std::vector<Text>& texts) {
    std::vector<Chunk> chunks;
    for (const Text& text : texts) {
        const bool ascii = std::all_of(text.text.begin(), text.text.end(),
                                       [](char c) { return static_cast<unsigned char>(c) < 0x80; });
        Bytes data = copyOf(asBytes(text.keyword.substr(0, kLongestKeyword)));
        append(data, 0, ascii ? 1 : 5, ByteOrder::Big);
        append(data, text.text);
        chunks.push_back({ascii ? "tEXt" : "iTXt", std::move(data)});
    }
    return chunks;
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
