#include "metadata/ExifBlock.h"

#include "metadata/TagDensity.h"

#include <algorithm>
#include <array>
#include <map>
#include <set>

namespace orvela {

namespace {

// The block and the pictures behind it; more have not been seen.
constexpr std::size_t kDirectories = 8;
constexpr std::size_t kEntrySize = 12;

bool overlap(std::size_t a, std::size_t aSize, std::size_t b, std::size_t bSize) {
    return a < b + bSize && b < a + aSize;
}

Bytes emptyBlock() {
    using namespace std::string_view_literals;
    return copyOf(asBytes("II*\0\x08\0\0\0\0\0\0\0\0\0"sv));
}

} // namespace

struct ExifBlock::Thumbnail {
    TagDirectory directory;
    std::size_t linkAt = 0; ///< in the directory before
    std::size_t at = 0;
    std::size_t length = 0; ///< 0 when it is no JPEG within the block
};

const TagDirectory* ExifDirectories::find(std::uint16_t pointer) const {
    const auto found =
        std::find_if(list.begin(), list.end(), [&](const auto& entry) { return entry.first == pointer; });
    return found == list.end() ? nullptr : &found->second;
}

ExifDirectories exifDirectories(const TiffView& view, std::size_t first) {
    ExifDirectories found;
    std::set<std::size_t> seen;
    const auto follow = [&](std::uint16_t pointer, auto place) {
        try {
            const std::size_t at = place();
            if (!seen.insert(at).second)
                throw DamagedBytes("its directories run in a circle");
            found.list.emplace_back(pointer, view.directory(at));
        } catch (const DamagedBytes&) {
            found.complete = false;
        }
    };
    follow(0, [&] { return first; });
    constexpr std::array<std::pair<std::uint16_t, std::uint16_t>, 3> below = {
        {{0, tiff::ExifIfd}, {0, tiff::GpsIfd}, {tiff::ExifIfd, tiff::InteropIfd}}};
    for (const auto& [above, pointer] : below) {
        const TagDirectory* directory = found.find(above);
        const TagEntry* entry = directory == nullptr ? nullptr : directory->find(pointer);
        if (entry != nullptr)
            follow(pointer, [&, e = *entry] { return view.value(e); });
    }
    return found;
}

Bytes thumbnailWithin(const ThumbnailMaker& make, const JpegSize& size, bool turned, std::size_t most) {
    constexpr std::array qualities = {88, 80, 70, 60, 50, 40, 30, 20, 10};
    for (const int quality : qualities) {
        Bytes jpeg = turned ? make(size.height, size.width, quality) : make(size.width, size.height, quality);
        if (!jpeg.empty() && jpeg.size() <= most)
            return jpeg;
    }
    return {};
}

ExifBlock::ExifBlock(Bytes block) : mBytes(std::move(block)) {
    if (mBytes.empty())
        return;
    try {
        const TiffView view(mBytes);
        mOrder = view.order();
        mDamaged = view.isBig() || !view.chain(kDirectories).complete ||
                   !exifDirectories(view, view.first()).complete;
    } catch (const DamagedBytes&) {
        mDamaged = true;
    }
}

// Calls edit(entry) wherever a directory of the block has the tag.
template <typename Edit>
void ExifBlock::forEach(std::uint16_t tag, Edit edit) const {
    if (mBytes.empty())
        return;
    try {
        const TiffView view(mBytes);
        std::vector<TagDirectory> directories = view.chain(kDirectories).list;
        for (auto& [pointer, directory] : exifDirectories(view, view.first()).list)
            if (pointer != 0)
                directories.push_back(std::move(directory));
        for (const TagDirectory& directory : directories)
            if (const TagEntry* entry = directory.find(tag))
                edit(*entry, directory.place == view.first());
    } catch (const DamagedBytes&) {
        // Without a header there is nothing to edit.
    }
}

void ExifBlock::patch(const TagEntry& entry, std::uint64_t value) {
    const bool fits = entry.type == tiff::Long || (entry.type == tiff::Short && value <= UINT16_MAX);
    if (fits && entry.count == 1)
        store(mBytes, entry.valueAt, value, tagTypeSize(entry.type), mOrder);
}

void ExifBlock::setDimensions(int width, int height) {
    const auto set = [this](std::uint16_t tag, int edge) {
        forEach(tag, [&](const TagEntry& entry, bool) { patch(entry, static_cast<std::uint64_t>(edge)); });
    };
    set(tiff::PixelXDimension, width);
    set(tiff::PixelYDimension, height);
    forEach(tiff::ImageWidth, [&](const TagEntry& entry, bool first) {
        if (first)
            patch(entry, static_cast<std::uint64_t>(width));
    });
    forEach(tiff::ImageLength, [&](const TagEntry& entry, bool first) {
        if (first)
            patch(entry, static_cast<std::uint64_t>(height));
    });
}

int ExifBlock::orientation() const {
    std::uint64_t found = 1;
    forEach(tiff::Orientation, [&](const TagEntry& entry, bool first) {
        if (first)
            found = TiffView(mBytes).value(entry);
    });
    return found >= 1 && found <= 8 ? static_cast<int>(found) : 1;
}

void ExifBlock::makeUpright() {
    forEach(tiff::Orientation, [&](const TagEntry& entry, bool) { patch(entry, 1); });
}

std::optional<Density> ExifBlock::density() const {
    if (mBytes.empty() || mDamaged)
        return std::nullopt;
    const TiffView view(mBytes);
    return orvela::densityOf(view, view.directory(view.first()));
}

bool ExifBlock::setDensity(const Density& density) {
    if (mDamaged)
        return false;
    std::vector<TagField> missing = densityFields(density, mOrder);
    std::erase_if(missing, [this](const TagField& field) {
        bool found = false;
        forEach(field.tag, [&](const TagEntry& entry, bool first) {
            if (!first || entry.type != field.type || entry.value.size() != field.value.size())
                return;
            std::copy(field.value.begin(), field.value.end(),
                      mBytes.begin() + static_cast<std::ptrdiff_t>(entry.valueAt));
            found = true;
        });
        return found;
    });
    add(missing);
    return true;
}

std::vector<ExifBlock::Thumbnail> ExifBlock::thumbnails() const {
    std::vector<Thumbnail> found;
    if (mBytes.empty())
        return found;
    try {
        const TiffView view(mBytes);
        std::vector<TagDirectory> chain = view.chain(kDirectories).list;
        for (std::size_t i = 1; i < chain.size(); ++i) {
            Thumbnail thumbnail{chain[i], chain[i - 1].linkAt};
            const TagEntry* at = chain[i].find(tiff::JpegOffset);
            const TagEntry* length = chain[i].find(tiff::JpegLength);
            if (at == nullptr && chain[i].find(tiff::StripOffsets) == nullptr)
                continue;
            if (at != nullptr && length != nullptr) {
                thumbnail.at = std::min(view.value(*at), mBytes.size());
                thumbnail.length = std::min(view.value(*length), mBytes.size() - thumbnail.at);
            }
            found.push_back(std::move(thumbnail));
        }
    } catch (const DamagedBytes&) {
        // What was found before stays found.
    }
    return found;
}

// Whether other parts of the block stand within the thumbnail's bytes.
bool ExifBlock::isShared(const Thumbnail& thumbnail) const {
    const TiffView view(mBytes);
    std::vector<TagDirectory> directories = view.chain(kDirectories).list;
    for (auto& [pointer, directory] : exifDirectories(view, view.first()).list)
        directories.push_back(std::move(directory));
    const auto meets = [&](std::size_t at, std::size_t size) {
        return overlap(thumbnail.at, thumbnail.length, at, size);
    };
    if (meets(0, view.headerSize()))
        return true;
    return std::any_of(directories.begin(), directories.end(), [&](const TagDirectory& directory) {
        return meets(directory.place, directory.size) ||
               std::any_of(directory.entries.begin(), directory.entries.end(),
                           [&](const TagEntry& e) { return meets(e.valueAt, e.value.size()); });
    });
}

bool ExifBlock::renew(const Thumbnail& thumbnail, const ThumbnailMaker& make, bool turned) {
    const std::optional<JpegSize> size = jpegSize(slice(mBytes, thumbnail.at, thumbnail.length));
    if (!size || !isThumbnailSize(*size) || isShared(thumbnail))
        return false;
    const Bytes jpeg = thumbnailWithin(make, *size, turned, thumbnail.length);
    if (jpeg.empty())
        return false;
    const auto place = mBytes.begin() + static_cast<std::ptrdiff_t>(thumbnail.at);
    std::fill_n(place, thumbnail.length, 0);
    std::copy(jpeg.begin(), jpeg.end(), place);
    patch(*thumbnail.directory.find(tiff::JpegLength), jpeg.size());
    return true;
}

bool ExifBlock::renewThumbnails(const ThumbnailMaker& make, bool turned) {
    bool all = true;
    std::vector<Thumbnail> found = thumbnails();
    // From the last one on: the link of each then leads to what is left behind it.
    std::reverse(found.begin(), found.end());
    for (const Thumbnail& thumbnail : found)
        if (!renew(thumbnail, make, turned)) {
            drop(thumbnail);
            all = false;
        }
    return all;
}

void ExifBlock::drop(const Thumbnail& thumbnail) {
    const std::size_t next =
        thumbnail.directory.next == 0 ? 0 : TiffView(mBytes).offset(thumbnail.directory.linkAt);
    store(mBytes, thumbnail.linkAt, next, 4, mOrder);
    if (isShared(thumbnail))
        return;
    constexpr std::size_t padding = 4;
    if (thumbnail.length > 0 && thumbnail.at + thumbnail.length + padding > mBytes.size())
        mBytes.resize(thumbnail.at);
    else
        std::fill_n(mBytes.begin() + static_cast<std::ptrdiff_t>(thumbnail.at), thumbnail.length, 0);
}

bool ExifBlock::dropThumbnails() {
    const ThumbnailMaker none = [](int, int, int) { return Bytes(); };
    return !renewThumbnails(none, false);
}

std::optional<std::string> ExifBlock::text(std::uint16_t tag) const {
    std::optional<std::string> found;
    forEach(tag, [&](const TagEntry& entry, bool first) {
        if (first)
            found = std::string(asText(entry.value)).c_str();
    });
    return found;
}

void ExifBlock::add(const std::vector<TagField>& fields) {
    if (fields.empty() || mDamaged)
        return;
    if (mBytes.empty())
        mBytes = emptyBlock();
    const TiffView view(mBytes);
    const TagDirectory old = view.directory(view.first());
    const auto isNew = [&](std::uint16_t tag) {
        return std::any_of(fields.begin(), fields.end(),
                           [tag](const TagField& field) { return field.tag == tag; });
    };
    std::multimap<std::uint16_t, Bytes> entries;
    for (const TagEntry& entry : old.entries)
        if (!isNew(entry.tag))
            entries.emplace(entry.tag, copyOf(slice(mBytes, entry.place, kEntrySize)));
    padToEven(mBytes);
    for (const TagField& field : fields) {
        Bytes entry;
        append(entry, field.tag, 2, mOrder);
        append(entry, field.type, 2, mOrder);
        append(entry, field.count, 4, mOrder);
        if (field.value.size() > 4) {
            append(entry, mBytes.size(), 4, mOrder);
            append(mBytes, field.value);
            padToEven(mBytes);
        } else {
            append(entry, field.value);
            entry.resize(kEntrySize);
        }
        entries.emplace(field.tag, std::move(entry));
    }
    store(mBytes, 4, mBytes.size(), 4, mOrder);
    append(mBytes, entries.size(), 2, mOrder);
    for (const auto& [tag, entry] : entries)
        append(mBytes, entry);
    append(mBytes, old.next, 4, mOrder);
}

} // namespace orvela
