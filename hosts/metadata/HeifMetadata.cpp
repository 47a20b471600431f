#include "metadata/HeifMetadata.h"

#include "metadata/HeifLibrary.h"

#include <algorithm>
#include <array>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr std::size_t kItems = 64;
using Items = std::array<heif_item_id, kItems>;

// The item is led in by the distance of the block behind it.
Bytes exifOf(Bytes item) {
    const std::size_t begin = 4 + number(item, 0, 4, ByteOrder::Big);
    Bytes block = copyOf(slice(item, begin, item.size() - std::min(begin, item.size())));
    if (startsWith(block, "Exif\0\0"sv))
        block.erase(block.begin(), block.begin() + 6);
    return block;
}

// Some writers leave another format's packet head before the packet.
Bytes xmpOf(const Bytes& item) {
    constexpr auto mark = "<x:xmpmeta"sv;
    constexpr auto bare = "<rdf:RDF"sv;
    const std::string_view text = asText(item);
    if (text.find(mark) == std::string_view::npos && text.find(bare) == std::string_view::npos)
        return {};
    return copyOf(asBytes(text.substr(text.find('<'))));
}

void takeItem(const heif_image_handle* picture, heif_item_id id, Metadata& metadata) {
    Bytes item(heif_image_handle_get_metadata_size(picture, id));
    const std::string type = heif_image_handle_get_metadata_type(picture, id);
    if (item.empty() || heif_image_handle_get_metadata(picture, id, item.data()).code != heif_error_Ok)
        return;
    if (type == "Exif" && metadata.exif.empty()) {
        metadata.exif = exifOf(std::move(item));
    } else if (type == "mime" && metadata.xmp.empty() && !xmpOf(item).empty()) {
        metadata.xmp = xmpOf(item);
    } else {
        metadata.unheld.push_back("a HEIF item of the kind " + type);
    }
}

void takeColors(const heif_image_handle* picture, Metadata& metadata) {
    heif_color_profile_nclx* found = nullptr;
    if (heif_image_handle_get_nclx_color_profile(picture, &found).code != heif_error_Ok)
        return;
    metadata.colors =
        ColorCodes{static_cast<std::uint16_t>(found->color_primaries),
                   static_cast<std::uint16_t>(found->transfer_characteristics),
                   static_cast<std::uint16_t>(found->matrix_coefficients), found->full_range_flag != 0};
    heif_nclx_color_profile_free(found);
}

void takeThumbnail(const heif_image_handle* picture, Metadata& metadata) {
    heif_item_id id = 0;
    heif_image_handle* thumbnail = nullptr;
    if (heif_image_handle_get_list_of_thumbnail_IDs(picture, &id, 1) != 1 ||
        heif_image_handle_get_thumbnail(picture, id, &thumbnail).code != heif_error_Ok)
        return;
    const HeifHandle owner(thumbnail);
    metadata.heifThumbnail =
        std::max(heif_image_handle_get_width(thumbnail), heif_image_handle_get_height(thumbnail));
}

std::string nameOf(std::string_view kind) {
    constexpr std::array<std::pair<std::string_view, const char*>, 8> names = {{
        {"hdrgainmap", "the gain map"},
        {"auxid:2", "the depth map"},
        {"auxiliary:depth", "the depth map"},
        {"portraiteffectsmatte", "the portrait matte"},
        {"semanticskinmatte", "the skin matte"},
        {"semantichairmatte", "the hair matte"},
        {"semanticteethmatte", "the teeth matte"},
        {"semanticskymatte", "the sky matte"},
    }};
    for (const auto& [part, name] : names)
        if (kind.find(part) != std::string_view::npos)
            return name;
    return "the auxiliary picture \"" + std::string(kind) + "\"";
}

void nameOtherPictures(heif_context* context, const heif_image_handle* picture, Metadata& metadata) {
    Items ids{};
    const int others = heif_image_handle_get_list_of_auxiliary_image_IDs(
        picture, LIBHEIF_AUX_IMAGE_FILTER_OMIT_ALPHA | LIBHEIF_AUX_IMAGE_FILTER_OMIT_DEPTH, ids.data(),
        kItems);
    for (int i = 0; i < others; ++i) {
        heif_image_handle* auxiliary = nullptr;
        const char* type = nullptr;
        const heif_item_id id = ids.at(static_cast<std::size_t>(i));
        if (heif_image_handle_get_auxiliary_image_handle(picture, id, &auxiliary).code != heif_error_Ok)
            continue;
        const HeifHandle owner(auxiliary);
        std::string name = "an auxiliary picture";
        if (heif_image_handle_get_auxiliary_type(auxiliary, &type).code == heif_error_Ok && type != nullptr) {
            name = nameOf(type);
            heif_image_handle_free_auxiliary_types(auxiliary, &type);
        }
        metadata.unheld.push_back(name);
    }
    if (heif_image_handle_has_depth_image(picture) != 0)
        metadata.unheld.emplace_back("the depth map");
    const int pictures = heif_context_get_number_of_top_level_images(context);
    if (pictures > 1)
        metadata.unheld.push_back(std::to_string(pictures - 1) +
                                  (pictures > 2 ? " further pictures" : " further picture"));
}

} // namespace

Metadata readHeifMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::Heif;
    const HeifContext context(heif_context_alloc());
    heif_image_handle* picture = nullptr;
    // What cannot be read here, the reader of the picture refuses.
    if (heif_context_read_from_memory_without_copy(context.get(), file.data(), file.size(), nullptr).code !=
            heif_error_Ok ||
        heif_context_get_primary_image_handle(context.get(), &picture).code != heif_error_Ok)
        return metadata;
    const HeifHandle owner(picture);
    Items ids{};
    const int items = heif_image_handle_get_list_of_metadata_block_IDs(picture, nullptr, ids.data(), kItems);
    for (int i = 0; i < items; ++i)
        try {
            takeItem(picture, ids.at(static_cast<std::size_t>(i)), metadata);
        } catch (const DamagedBytes&) {
            metadata.damaged.emplace_back("the Exif data");
        }
    takeColors(picture, metadata);
    takeThumbnail(picture, metadata);
    nameOtherPictures(context.get(), picture, metadata);
    return metadata;
}

} // namespace orvela
