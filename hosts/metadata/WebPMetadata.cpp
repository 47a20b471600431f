#include "metadata/WebPMetadata.h"

#include <webp/mux.h>

#include <memory>
#include <new>

namespace orvela {

namespace {

using namespace std::string_view_literals;

struct Release {
    void operator()(WebPMux* mux) const { WebPMuxDelete(mux); }
};
using Mux = std::unique_ptr<WebPMux, Release>;

// Refers to the file.
Mux open(ByteView file) {
    const WebPData data{file.data(), file.size()};
    return Mux(WebPMuxCreate(&data, 0));
}

Bytes chunkOf(const Mux& mux, const char* name) {
    WebPData data{};
    if (!mux || WebPMuxGetChunk(mux.get(), name, &data) != WEBP_MUX_OK)
        return {};
    return {data.bytes, data.bytes + data.size};
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
    const Mux mux = open(file);
    metadata.exif = chunkOf(mux, "EXIF");
    // Some writers leave the head of a JPEG segment before it.
    if (startsWith(metadata.exif, "Exif\0\0"sv))
        metadata.exif.erase(metadata.exif.begin(), metadata.exif.begin() + 6);
    metadata.xmp = chunkOf(mux, "XMP ");
    int unknown = 0;
    if (mux && WebPMuxNumChunks(mux.get(), WEBP_CHUNK_UNKNOWN, &unknown) == WEBP_MUX_OK && unknown > 0)
        metadata.unheld.emplace_back("chunks of an unknown kind");
    return metadata;
}

void embedIntoWebP(const Metadata& metadata, Bytes& encoded) {
    const Mux mux = open(encoded);
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
