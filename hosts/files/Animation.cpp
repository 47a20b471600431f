#include "files/Animation.h"

#include <algorithm>
#include <initializer_list>
#include <string_view>

namespace orvela {

namespace {

// A named part of a file; its content ends with the file when it is cut short.
struct Part {
    std::string_view name;
    ByteView content;
};

int count(std::uint64_t number) {
    return static_cast<int>(std::min<std::uint64_t>(number, INT32_MAX));
}

std::uint64_t numberIn(ByteView bytes, std::size_t at, std::size_t size, ByteOrder order = ByteOrder::Big) {
    return at + size <= bytes.size() ? number(bytes, at, size, order) : 0;
}

Part part(ByteView bytes, std::size_t nameAt, std::size_t contentAt, std::uint64_t length) {
    const std::size_t first = std::min(contentAt, bytes.size());
    return {asText(bytes.subspan(nameAt, 4)),
            bytes.subspan(first, std::min<std::uint64_t>(length, bytes.size() - first))};
}

std::vector<Part> pngChunks(ByteView file) {
    std::vector<Part> chunks;
    for (std::uint64_t at = 8; at + 8 <= file.size(); at += 12 + numberIn(file, at, 4))
        chunks.push_back(part(file, at + 4, at + 8, numberIn(file, at, 4)));
    return chunks;
}

std::vector<Part> webpChunks(ByteView file) {
    std::vector<Part> chunks;
    for (std::uint64_t at = 12; at + 8 <= file.size();) {
        const std::uint64_t length = numberIn(file, at + 4, 4, ByteOrder::Little);
        chunks.push_back(part(file, at, at + 8, length));
        at += 8 + length + length % 2;
    }
    return chunks;
}

std::vector<Part> boxes(ByteView bytes) {
    std::vector<Part> found;
    for (std::uint64_t at = 0; at + 8 <= bytes.size();) {
        std::uint64_t size = numberIn(bytes, at, 4);
        const std::size_t head = size == 1 ? 16 : 8;
        if (size == 1)
            size = numberIn(bytes, at + 8, 8);
        if (size == 0 || size > bytes.size() - at)
            size = bytes.size() - at;
        if (size < head)
            break;
        found.push_back(part(bytes, at + 4, at + head, size - head));
        at += size;
    }
    return found;
}

// The content of the box that the names lead to, one below the other; empty when there is none.
ByteView boxIn(ByteView bytes, std::initializer_list<std::string_view> names) {
    for (const std::string_view name : names) {
        const std::vector<Part> all = boxes(bytes);
        const auto found =
            std::find_if(all.begin(), all.end(), [name](const Part& box) { return box.name == name; });
        bytes = found == all.end() ? ByteView() : found->content;
    }
    return bytes;
}

} // namespace

int pngFrames(ByteView file) {
    std::uint64_t frames = 0;
    bool isFrame = false; // the picture for readers that do not know animations
    for (const Part& chunk : pngChunks(file)) {
        if (chunk.name == "IDAT")
            break;
        if (chunk.name == "acTL")
            frames = numberIn(chunk.content, 0, 4);
        isFrame = isFrame || chunk.name == "fcTL";
    }
    return frames == 0 ? 1 : std::max(count(frames), isFrame ? 1 : 2);
}

int webpFrames(ByteView file) {
    const std::vector<Part> chunks = webpChunks(file);
    const auto frames =
        std::count_if(chunks.begin(), chunks.end(), [](const Part& chunk) { return chunk.name == "ANMF"; });
    return std::max(1, static_cast<int>(frames));
}

HeifPictures heifPictures(ByteView file) {
    HeifPictures pictures;
    for (const Part& box : boxes(file)) {
        pictures.still = pictures.still || box.name == "meta";
        if (box.name != "moov")
            continue;
        for (const Part& track : boxes(box.content)) {
            constexpr std::string_view picture = "pict";
            const ByteView handler = boxIn(track.content, {"mdia", "hdlr"});
            const ByteView sizes = boxIn(track.content, {"mdia", "minf", "stbl", "stsz"});
            if (track.name == "trak" && handler.size() >= 12 &&
                std::equal(picture.begin(), picture.end(), handler.begin() + 8))
                pictures.frames = std::max(pictures.frames, count(numberIn(sizes, 8, 4)));
        }
    }
    return pictures;
}

} // namespace orvela
