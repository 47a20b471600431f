#include "metadata/HeifMetadata.h"

#include "metadata/HeifLibrary.h"
#include "metadata/HeifStructure.h"

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
    if (item.empty() || heif_image_handle_get_metadata(picture, id, item.data()).code != heif_error_Ok) {
        nameOnce(metadata.unheld, "a HEIF item of the kind " + type + ", which cannot be read");
        return;
    }
    if (type == "Exif" && metadata.exif.empty()) {
        metadata.exif = exifOf(std::move(item));
    } else if (type == "mime" && metadata.xmp.empty() && !xmpOf(item).empty()) {
        metadata.xmp = xmpOf(item);
    } else {
        nameOnce(metadata.unheld, "a HEIF item of the kind " + type);
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
        nameOnce(metadata.unheld, name);
    }
    if (heif_image_handle_has_depth_image(picture) != 0)
        nameOnce(metadata.unheld, "the depth map");
    const int pictures = heif_context_get_number_of_top_level_images(context);
    if (pictures > 1)
        metadata.unheld.push_back(std::to_string(pictures - 1) +
                                  (pictures > 2 ? " further pictures" : " further picture"));
}

template <std::size_t count>
bool isAmong(const std::array<std::string_view, count>& names, std::string_view name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

// Items of metadata that nothing says to be about a picture; of those about other pictures these tell.
void nameStrayItems(ByteView meta, Metadata& metadata) {
    constexpr std::array pictures = {"hvc1"sv, "hev1"sv, "lhv1"sv, "av01"sv, "avc1"sv, "vvc1"sv, "jpeg"sv,
                                     "j2k1"sv, "unci"sv, "grid"sv, "iden"sv, "iovl"sv, "mski"sv};
    const auto descriptions = heifReferences(meta, "cdsc");
    for (const HeifItem& item : heifItems(meta))
        if (item.type == "tmap")
            nameOnce(metadata.unheld, "the gain map");
        else if (!isAmong(pictures, item.type) && !descriptions.contains(item.id))
            nameOnce(metadata.unheld, "a HEIF item of the kind " + std::string(item.type));
}

bool holdsFilmTrack(ByteView moov) try {
    for (const HeifBox& track : heifBoxes(moov)) {
        if (track.type != "trak")
            continue;
        const std::string_view handler = asText(heifBoxIn(heifBoxIn(track.content, "mdia"), "hdlr"));
        if (handler.size() >= 12 && (handler.substr(8, 4) == "vide" || handler.substr(8, 4) == "soun"))
            return true;
    }
    return false;
} catch (const DamagedBytes&) {
    return true; // one that is not whole
}

// Returns what is no box of this picture any more: nothing, a film with boxes of its own, anything.
ByteView nameBoxes(ByteView file, Metadata& metadata) {
    constexpr std::array known = {"ftyp"sv, "meta"sv, "mdat"sv, "idat"sv, "free"sv, "skip"sv, "wide"sv};
    Cursor cursor(file);
    while (!cursor.isAtEnd()) {
        const ByteView rest = cursor.rest();
        HeifBox box;
        try {
            box = nextHeifBox(cursor);
        } catch (const DamagedBytes&) {
            const bool cutShort = rest.size() >= 8 && isAmong(known, asText(rest.subspan(4, 4)));
            return cutShort ? ByteView() : rest; // of the picture itself, which its reader judges
        }
        const bool named =
            std::all_of(box.type.begin(), box.type.end(), [](char c) { return c >= ' ' && c <= '~'; });
        if (!named || (box.type == "ftyp" && rest.size() < file.size()))
            return rest;
        if (box.type == "mpvd" || (box.type == "moov" && holdsFilmTrack(box.content)))
            nameOnce(metadata.unheld, "the film beside the picture");
        else if (box.type != "moov" && !isAmong(known, box.type))
            nameOnce(metadata.unheld, "the HEIF box " + std::string(box.type));
    }
    return {};
}

void nameWhatIsBeside(ByteView file, Metadata& metadata) {
    try {
        nameStrayItems(heifMeta(file), metadata);
    } catch (const DamagedBytes&) {
        nameOnce(metadata.unheld, "what its unreadable list of items tells of");
    }
    nameRest(nameBoxes(file, metadata), metadata);
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
    nameWhatIsBeside(file, metadata);
    return metadata;
}

} // namespace orvela
