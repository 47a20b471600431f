#include "metadata/NotePreviews.h"

#include <algorithm>

namespace orvela {

namespace {

constexpr std::size_t kDirectories = 8;
constexpr int kMostPlaces = 64; // at which a preview may seem to begin

struct Range {
    std::size_t at;
    std::size_t size;
};

// A thumbnail that a directory tells of.
Range thumbnailOf(const TiffView& view, const TagDirectory& directory) {
    const TagEntry* at = directory.find(tiff::JpegOffset);
    const TagEntry* length = directory.find(tiff::JpegLength);
    if (at == nullptr || length == nullptr || at->value.empty() || length->value.empty())
        return {};
    return {view.value(*at), view.value(*length)};
}

// What is no preview of the maker's: everything that the directories tell of but the note.
std::vector<Range> otherRanges(const TiffView& view) {
    std::vector<TagDirectory> directories = view.chain(kDirectories).list;
    for (auto& [pointer, directory] : exifDirectories(view, view.first()).list)
        directories.push_back(std::move(directory));
    std::vector<Range> ranges = {{0, view.headerSize()}};
    for (const TagDirectory& directory : directories) {
        ranges.push_back({directory.place, directory.size});
        ranges.push_back(thumbnailOf(view, directory));
        for (const TagEntry& entry : directory.entries)
            if (entry.tag != tiff::MakerNote)
                ranges.push_back({entry.valueAt, entry.value.size()});
    }
    return ranges;
}

// Bytes of the JPEG that begins there; 0 when it has no frame or no end.
std::size_t jpegLength(ByteView bytes) {
    const std::size_t length = bytes.size() - behindJpeg(bytes).size();
    const bool ends = length >= 4 && bytes[length - 2] == 0xFF && bytes[length - 1] == 0xD9;
    return ends && jpegSize(bytes) ? length : 0;
}

bool renew(Bytes& block, const Range& place, const ThumbnailMaker& make, bool turned) {
    const std::optional<JpegSize> size = jpegSize(slice(block, place.at, place.size));
    const bool known = size && isThumbnailSize(*size);
    const Bytes jpeg = known ? thumbnailWithin(make, *size, turned, place.size) : Bytes();
    const auto begin = block.begin() + static_cast<std::ptrdiff_t>(place.at);
    std::fill_n(begin, place.size, 0);
    std::copy(jpeg.begin(), jpeg.end(), begin);
    return !jpeg.empty();
}

} // namespace

bool renewNotePreviews(Bytes& block, const ThumbnailMaker& make, bool turned) {
    if (ExifBlock(block).isDamaged() || block.empty())
        return true;
    const std::vector<Range> others = otherRanges(TiffView(block));
    const auto isFree = [&](const Range& place) {
        return std::none_of(others.begin(), others.end(), [&](const Range& other) {
            return place.at < other.at + other.size && other.at < place.at + place.size;
        });
    };
    bool all = true;
    int places = 0;
    const auto next = [&](std::size_t from) { return asText(block).find("\xFF\xD8\xFF", from); };
    for (std::size_t at = next(0); at != std::string_view::npos && places < kMostPlaces; ++places) {
        const Range place{at, jpegLength(ByteView(block).subspan(at))};
        if (place.size > 0 && isFree(place))
            all = renew(block, place, make, turned) && all;
        at = next(at + std::max<std::size_t>(1, place.size));
    }
    return all;
}

} // namespace orvela
