#include "metadata/PsdMetadata.h"

#include "metadata/ImageResources.h"

#include <array>
#include <cstdlib>

namespace orvela {

namespace {

constexpr std::size_t kHeader = 26;

Bytes dataOf(const ImageResources& resources, std::uint16_t id) {
    const ImageResource* found = resources.find(id);
    return found == nullptr ? Bytes() : copyOf(found->data);
}

// Of a kind that has one place, what stands behind the first.
void nameFurther(const ImageResources& resources, Metadata& metadata) {
    constexpr std::array<std::pair<std::uint16_t, const char*>, 4> kinds = {
        {{resource::Exif, "a second Exif block"},
         {resource::Exif3, "a second Exif block"},
         {resource::Xmp, "a second XMP packet"},
         {resource::IccProfile, "a second ICC profile"}}};
    for (const ImageResource& one : resources.list)
        for (const auto& [id, name] : kinds) {
            const std::uint16_t taken = id == resource::Exif3 ? std::uint16_t{resource::Exif} : id;
            const ImageResource* first = resources.find(taken);
            if (one.id == id && (first == nullptr || !sameBytes(one.data, first->data)))
                nameOnce(metadata.unheld, name);
        }
}

// Among the file's resources, those that another format has a place of its own for, or that tell of layers.
const std::vector<std::uint16_t> kElsewhere = {
    resource::IccProfile, resource::Exif, resource::Exif3, resource::Xmp, 0x0400, 0x0402, 0x042D, 0x0430};

// Those of 16 bits stand in a named block, of a multiple of four bytes, behind the place of others.
ByteView deepLayers(Cursor section) {
    section.block(); // the mask of all
    while (section.rest().size() >= 12) {
        section.take(4);
        const std::string_view name = asText(section.take(4));
        const ByteView data = section.block();
        if (name == "Lr16")
            return data;
        section.take((4 - data.size() % 4) % 4);
    }
    return {};
}

} // namespace

Metadata readPsdMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::Psd;
    try {
        Cursor cursor(file);
        cursor.take(kHeader);
        cursor.block(); // the palette
        const ByteView list = cursor.block();
        const ImageResources resources = imageResources(list);
        metadata.exif = dataOf(resources, resource::Exif);
        metadata.xmp = dataOf(resources, resource::Xmp);
        metadata.density = resourceDensity(list);
        nameFurther(resources, metadata);
        metadata.resources = withoutResources(list, kElsewhere);
        if (psdLayers(cursor.block()).count > 0)
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
        Cursor cursor(section);
        ByteView list = cursor.isAtEnd() ? section : cursor.block();
        if (list.empty() && !cursor.isAtEnd())
            list = deepLayers(cursor);
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
