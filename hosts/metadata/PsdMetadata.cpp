#include "metadata/PsdMetadata.h"

#include "metadata/ImageResources.h"

#include <cstdlib>

namespace orvela {

namespace {

constexpr std::size_t kHeader = 26;

// The part of the file at `at`, which is moved behind it.
ByteView part(ByteView file, std::size_t& at) {
    const std::size_t size = number(file, at, 4, ByteOrder::Big);
    const ByteView data = slice(file, at + 4, size);
    at += 4 + size;
    return data;
}

Bytes dataOf(const ImageResources& resources, std::uint16_t id) {
    const ImageResource* found = resources.find(id);
    return found == nullptr ? Bytes() : copyOf(found->data);
}

// Among the file's resources, those that another format has a place of its own for, or that tell of layers.
const std::vector<std::uint16_t> kElsewhere = {
    resource::IccProfile, resource::Exif, resource::Exif3, resource::Xmp, 0x0400, 0x0402, 0x042D, 0x0430};

// A single one is the merged picture itself. Below zero the first transparency is that of the merged picture.
int layerCount(ByteView layers) {
    if (layers.size() < 6 || number(layers, 0, 4, ByteOrder::Big) == 0)
        return 0;
    const auto count = static_cast<std::int16_t>(number(layers, 4, 2, ByteOrder::Big));
    return std::abs(int{count});
}

} // namespace

Metadata readPsdMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::Psd;
    try {
        std::size_t at = kHeader;
        part(file, at); // the palette
        const ByteView list = part(file, at);
        const ImageResources resources = imageResources(list);
        metadata.exif = dataOf(resources, resource::Exif);
        metadata.xmp = dataOf(resources, resource::Xmp);
        metadata.density = resourceDensity(list);
        metadata.resources = withoutResources(list, kElsewhere);
        if (layerCount(part(file, at)) > 1)
            metadata.unheld.emplace_back("the layers");
    } catch (const DamagedBytes&) {
        metadata.damaged.emplace_back("Photoshop's data");
    }
    return metadata;
}

} // namespace orvela
