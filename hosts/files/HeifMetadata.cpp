#include "files/HeifMetadata.h"

#include "files/Vips.h"

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

namespace orvela {

namespace {

Bytes blob(VipsImage* image, const char* field) {
    const void* data = nullptr;
    std::size_t size = 0;
    if (vips_image_get_typeof(image, field) == 0 || vips_image_get_blob(image, field, &data, &size) != 0)
        return {};
    const auto* bytes = static_cast<const std::uint8_t*>(data);
    return {bytes, bytes + size};
}

// The decoder numbers the items of a MIME kind, of which XMP is one. Some writers leave another format's
// packet head before it.
Bytes xmpOf(VipsImage* image) {
    constexpr std::string_view mark = "<x:xmpmeta";
    for (int item = 0; item < 16; ++item) {
        Bytes bytes = blob(image, ("heif-mime-" + std::to_string(item)).c_str());
        if (std::search(bytes.begin(), bytes.end(), mark.begin(), mark.end()) == bytes.end())
            continue;
        bytes.erase(bytes.begin(), std::find(bytes.begin(), bytes.end(), '<'));
        return bytes;
    }
    return {};
}

MetadataBlocks blocksOf(VipsImage* image) {
    const VipsHandle owner(image);
    if (!owner)
        throw PhotographError(takeVipsError());
    MetadataBlocks blocks{blob(image, VIPS_META_EXIF_NAME), xmpOf(image)};
    constexpr std::array<std::uint8_t, 6> prefix = {'E', 'x', 'i', 'f', 0, 0};
    if (blocks.exif.size() >= prefix.size() && std::equal(prefix.begin(), prefix.end(), blocks.exif.begin()))
        blocks.exif.erase(blocks.exif.begin(), blocks.exif.begin() + prefix.size());
    return blocks;
}

} // namespace

MetadataBlocks heifMetadata(ByteView file) {
    startVips();
    VipsImage* image = nullptr;
    vips_heifload_buffer(const_cast<std::uint8_t*>(file.data()), file.size(), &image, nullptr);
    return blocksOf(image);
}

} // namespace orvela
