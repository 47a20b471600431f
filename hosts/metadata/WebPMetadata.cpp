#include "metadata/WebPMetadata.h"

#include <webp/mux.h>

#include <algorithm>
#include <array>
#include <memory>
#include <new>

namespace orvela {

namespace {

using namespace std::string_view_literals;

struct Release {
    void operator()(WebPMux* mux) const { WebPMuxDelete(mux); }
};
using Mux = std::unique_ptr<WebPMux, Release>;

struct RiffChunk {
    std::string_view name;
    ByteView data;
};

// From `at` on as far as they are whole. libwebp's own reader is stricter than its decoder.
std::vector<RiffChunk> chunksOf(ByteView file, std::size_t at) {
    std::vector<RiffChunk> chunks;
    constexpr std::size_t head = 8;
    while (at + head <= file.size()) {
        const std::size_t size = number(file, at + 4, 4, ByteOrder::Little);
        if (size > file.size() - at - head)
            break;
        chunks.push_back({asText(file.subspan(at, 4)), file.subspan(at + head, size)});
        at += head + size + size % 2;
    }
    return chunks;
}

constexpr std::size_t kBehindHead = 12;

// Without what stands behind the end that the head tells.
ByteView wholeOf(ByteView file) {
    if (file.size() < kBehindHead)
        return {};
    const std::size_t size = 8 + number(file, 4, 4, ByteOrder::Little);
    return file.first(std::min(file.size(), size + size % 2));
}

bool isPicture(std::string_view name) {
    constexpr std::array names = {"VP8X"sv, "VP8 "sv, "VP8L"sv, "ALPH"sv, "ANIM"sv, "ANMF"sv, "ICCP"sv};
    return std::find(names.begin(), names.end(), name) != names.end();
}

void put(const Mux& mux, const char* name, const Bytes& bytes) {
    WebPMuxDeleteChunk(mux.get(), name);
    const WebPData data{bytes.data(), bytes.size()};
    if (!bytes.empty() && WebPMuxSetChunk(mux.get(), name, &data, 0) != WEBP_MUX_OK)
        throw std::bad_alloc();
}

} // namespace

Metadata readWebPMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::WebP;
    const ByteView whole = wholeOf(file);
    for (const RiffChunk& chunk : chunksOf(whole, kBehindHead)) {
        if (chunk.name == "EXIF" && metadata.exif.empty())
            metadata.exif = copyOf(chunk.data);
        else if (chunk.name == "XMP " && metadata.xmp.empty())
            metadata.xmp = copyOf(chunk.data);
        else if (!isPicture(chunk.name))
            metadata.unheld.push_back("the WebP chunk " + std::string(chunk.name));
    }
    nameRest(behind(file, whole.size()), metadata);
    // Some writers leave the head of a JPEG segment before it.
    if (startsWith(metadata.exif, "Exif\0\0"sv))
        metadata.exif.erase(metadata.exif.begin(), metadata.exif.begin() + 6);
    return metadata;
}

WebPPictures webpPictures(ByteView file) {
    constexpr std::size_t frameHead = 16;
    const std::vector<RiffChunk> chunks = chunksOf(wholeOf(file), kBehindHead);
    const auto isFrame = [](const RiffChunk& chunk) { return chunk.name == "ANMF"; };
    const auto first = std::find_if(chunks.begin(), chunks.end(), isFrame);
    const auto codings = first == chunks.end() ? chunks : chunksOf(first->data, frameHead);
    WebPPictures pictures;
    pictures.frames = std::max(1, static_cast<int>(std::count_if(chunks.begin(), chunks.end(), isFrame)));
    pictures.lossless = std::any_of(codings.begin(), codings.end(),
                                    [](const RiffChunk& chunk) { return chunk.name == "VP8L"; });
    return pictures;
}

void embedIntoWebP(const Metadata& metadata, Bytes& encoded) {
    const WebPData data{encoded.data(), encoded.size()};
    const Mux mux(WebPMuxCreate(&data, 0));
    if (!mux)
        throw DamagedBytes("it is no WebP");
    put(mux, "EXIF", metadata.exif);
    put(mux, "XMP ", metadata.xmp);
    WebPData assembled{};
    if (WebPMuxAssemble(mux.get(), &assembled) != WEBP_MUX_OK)
        throw std::bad_alloc();
    Bytes file(assembled.bytes, assembled.bytes + assembled.size);
    WebPDataClear(&assembled);
    encoded = std::move(file);
}

} // namespace orvela
