#include "metadata/PngTexts.h"

#include "metadata/TiffStructure.h"
#include "metadata/Utf8.h"

#include <zlib.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <memory>
#include <new>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr std::size_t kLongestKeyword = 79;

// A small chunk may claim to hold any amount.
Bytes inflated(ByteView packed, TextRoom& room) {
    const std::size_t most = std::min(room.kept, room.tried);
    z_stream stream{};
    if (inflateInit(&stream) != Z_OK)
        throw DamagedBytes("it cannot be unpacked");
    const std::unique_ptr<z_stream, decltype(&inflateEnd)> end(&stream, inflateEnd);
    Bytes plain;
    stream.next_in = const_cast<Bytef*>(packed.data());
    stream.avail_in = static_cast<uInt>(packed.size());
    int state = Z_OK;
    while (state == Z_OK && plain.size() <= most) {
        std::array<std::uint8_t, 16384> piece{};
        stream.next_out = piece.data();
        stream.avail_out = piece.size();
        state = inflate(&stream, Z_NO_FLUSH);
        append(plain, ByteView(piece).first(piece.size() - stream.avail_out));
    }
    room.tried -= std::min(room.tried, plain.size());
    if (plain.size() > most)
        throw LongText("there is no room for it");
    if (state != Z_STREAM_END)
        throw DamagedBytes("it cannot be unpacked");
    room.kept -= plain.size();
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

bool isUnderstood(const std::string& keyword) {
    return keyword == kXmpKeyword || keyword == kCommentKeyword || keyword.starts_with(kProfileKeyword) ||
           tagOfKeyword(keyword) != 0;
}

} // namespace

bool isPngText(std::string_view chunk) {
    return chunk == "tEXt" || chunk == "zTXt" || chunk == "iTXt";
}

std::string_view pngKeyword(const PngChunk& chunk) {
    const std::size_t end = asText(chunk.data).find('\0');
    return end == std::string_view::npos ? std::string_view() : asText(chunk.data).substr(0, end);
}

std::string shownKeyword(const std::string& keyword) {
    return keyword.empty() ? "without a keyword" : keyword;
}

Text pngText(const PngChunk& chunk, TextRoom& room) {
    ByteView data = chunk.data;
    Text text{latinToUtf8(asBytes(word(data))), {}};
    if (!isUnderstood(text.keyword))
        return text;
    if (chunk.name == "tEXt")
        text.text = latinToUtf8(data);
    else if (chunk.name == "zTXt")
        text.text = latinToUtf8(inflated(from(data, 1), room));
    else {
        const bool packed = number(data, 0, 1, ByteOrder::Big) != 0;
        data = from(data, 2);
        word(data); // language
        word(data); // keyword in that language
        text.text = packed ? std::string(asText(inflated(data, room))) : std::string(asText(data));
    }
    return text;
}

Bytes rawProfile(const std::string& text) {
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

std::uint16_t tagOfKeyword(const std::string& keyword) {
    constexpr std::array<std::pair<std::string_view, std::uint16_t>, 4> table = {
        {{"Author", tiff::Artist},
         {"Copyright", tiff::Copyright},
         {"Description", tiff::ImageDescription},
         {"Software", tiff::Software}}};
    const auto found =
        std::find_if(table.begin(), table.end(), [&](const auto& entry) { return entry.first == keyword; });
    return found == table.end() ? 0 : found->second;
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

// As most programs write IPTC, too: the list of resources that it stands in.
Chunk pngResources(ByteView resources) {
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
    Bytes data = copyOf(asBytes(kProfileKeyword));
    append(data, "iptc");
    append(data, 0, 2, ByteOrder::Big); // end of the keyword, deflated
    append(data, deflated(asBytes(text)));
    return {"zTXt", std::move(data)};
}

} // namespace orvela
