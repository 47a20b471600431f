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

struct Layout {
    std::vector<Range> notes;
    std::vector<Range> others; ///< no preview of the maker's: all else that the directories tell of
};

Layout layoutOf(const TiffView& view) {
    std::vector<TagDirectory> directories = view.chain(kDirectories).list;
    for (auto& [pointer, directory] : exifDirectories(view, view.first()).list)
        directories.push_back(std::move(directory));
    Layout layout{{}, {{0, view.headerSize()}}};
    for (const TagDirectory& directory : directories) {
        layout.others.push_back({directory.place, directory.size});
        layout.others.push_back(thumbnailOf(view, directory));
        for (const TagEntry& entry : directory.entries)
            (entry.tag == tiff::MakerNote ? layout.notes : layout.others)
                .push_back({entry.valueAt, entry.value.size()});
    }
    return layout;
}

// Where the range ends that the place is in; 0 when it is in none.
std::size_t endAround(std::size_t at, const std::vector<Range>& ranges) {
    std::size_t end = 0;
    for (const Range& range : ranges)
        if (range.at <= at && at < range.at + range.size)
            end = std::max(end, range.at + range.size);
    return end;
}

// A preview ends within its note, and before anything else begins.
std::size_t furthestEnd(std::size_t at, const Layout& layout, std::size_t end) {
    if (const std::size_t note = endAround(at, layout.notes))
        end = std::min(end, note);
    for (const Range& other : layout.others)
        if (other.size > 0 && other.at > at)
            end = std::min(end, other.at);
    return end;
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
    const Layout layout = layoutOf(TiffView(block));
    bool all = true;
    int places = 0;
    const auto next = [&](std::size_t from) { return asText(block).find("\xFF\xD8\xFF", from); };
    for (std::size_t at = next(0); at != std::string_view::npos && places < kMostPlaces; ++places) {
        if (const std::size_t other = endAround(at, layout.others)) {
            at = next(other);
            continue;
        }
        const ByteView room = slice(block, at, furthestEnd(at, layout, block.size()) - at);
        const std::size_t size = jpegSize(room) ? jpegLength(room) : 0;
        if (size > 0)
            all = renew(block, {at, size}, make, turned) && all;
        else if (jpegSize(room))
            all = false; // what belongs to it cannot be told from what follows
        at = next(at + std::max<std::size_t>(1, size));
    }
    return all;
}

} // namespace orvela
