#include "metadata/PngChunks.h"

#include <zlib.h>

#include <algorithm>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr auto kSignature = "\x89PNG\r\n\x1A\n"sv;
constexpr std::size_t kHead = 8; ///< length and name
constexpr std::size_t kSum = 4;

// Calls visit(chunk) for each chunk; returns what stands behind the last.
template <typename Visit>
ByteView walk(ByteView file, Visit visit) {
    for (std::size_t at = kSignature.size(); at + kHead + kSum <= file.size();) {
        const std::size_t size = number(file, at, 4, ByteOrder::Big);
        if (size > file.size() - at - kHead - kSum)
            break;
        const PngChunk chunk{asText(file.subspan(at + 4, 4)), file.subspan(at + kHead, size),
                             file.subspan(at, kHead + size + kSum)};
        visit(chunk);
        at += chunk.whole.size();
        if (chunk.name == "IEND")
            return behind(file, at);
    }
    return {};
}

} // namespace

std::vector<PngChunk> pngChunks(ByteView file) {
    std::vector<PngChunk> chunks;
    walk(file, [&](const PngChunk& chunk) { chunks.push_back(chunk); });
    return chunks;
}

ByteView behindPng(ByteView file) {
    return walk(file, [](const PngChunk&) {});
}

bool hasPngChunk(ByteView file, std::string_view name) {
    const std::vector<PngChunk> chunks = pngChunks(file);
    return std::any_of(chunks.begin(), chunks.end(), [&](const PngChunk& one) { return one.name == name; });
}

int pngFrames(ByteView file) {
    std::uint64_t frames = 0;
    bool isFrame = false; // the picture for readers that do not know animations
    for (const PngChunk& chunk : pngChunks(file)) {
        if (chunk.name == "IDAT")
            break;
        if (chunk.name == "acTL" && chunk.data.size() >= 4)
            frames = number(chunk.data, 0, 4, ByteOrder::Big);
        isFrame = isFrame || chunk.name == "fcTL";
    }
    const int shown = static_cast<int>(std::min<std::uint64_t>(frames, INT32_MAX));
    return shown == 0 ? 1 : std::max(shown, isFrame ? 1 : 2);
}

Bytes emptyPng() {
    return copyOf(asBytes(kSignature));
}

void putPngChunk(Bytes& file, std::string_view name, ByteView data) {
    append(file, data.size(), 4, ByteOrder::Big);
    const std::size_t at = file.size();
    append(file, name);
    append(file, data);
    const ByteView summed = ByteView(file).subspan(at);
    append(file, crc32(0, summed.data(), static_cast<uInt>(summed.size())), 4, ByteOrder::Big);
}

} // namespace orvela
