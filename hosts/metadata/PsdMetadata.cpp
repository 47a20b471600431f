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

// Those of 16 bits stand in a named block behind the place of others.
ByteView deepLayers(ByteView section, std::size_t at) {
    part(section, at); // the mask of all
    while (at + 12 <= section.size()) {
        const std::string_view name = asText(slice(section, at + 4, 4));
        at += 8;
        const ByteView data = part(section, at);
        if (name == "Lr16")
            return data;
        at = (at + 3) / 4 * 4;
    }
    return {};
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
        if (psdLayers(part(file, at)).count > 0)
            metadata.unheld.emplace_back("the layers");
    } catch (const DamagedBytes&) {
        metadata.damaged.emplace_back("Photoshop's data");
    }
    return metadata;
}

// The count is below zero where the first channel beside the colours is transparency.
PsdLayers psdLayers(ByteView section) {
    PsdLayers layers;
    try {
        std::size_t at = 0;
        ByteView list = section.empty() ? section : part(section, at);
        if (list.empty() && !section.empty())
            list = deepLayers(section, at);
        if (list.empty())
            return layers;
        const auto count = static_cast<std::int16_t>(number(list, 0, 2, ByteOrder::Big));
        layers.transparency = count < 0;
        layers.count = std::abs(int{count}) > 1 ? std::abs(int{count}) : 0;
    } catch (const DamagedBytes&) {
        // Then none can be told of.
    }
    return layers;
}

} // namespace orvela
