#include "metadata/TiffStructure.h"

#include <algorithm>
#include <array>
#include <set>

namespace orvela {

namespace {

// Ascending. Thresholds, cell sizes and other remarks on how the picture came to be are not among them.
constexpr std::array<std::uint16_t, 53> kStructure = {
    0x00FE, 0x00FF, 0x0100, 0x0101, 0x0102, 0x0103, 0x0106, 0x010A, 0x0111, 0x0115, 0x0116,
    0x0117, 0x0118, 0x0119, 0x011C, 0x0120, 0x0121, 0x0122, 0x0123, 0x0124, 0x0125, 0x013D,
    0x0140, 0x0142, 0x0143, 0x0144, 0x0145, 0x014A, 0x014C, 0x014D, 0x014E, 0x0150, 0x0152,
    0x0153, 0x0154, 0x0155, 0x015B, 0x0200, 0x0201, 0x0202, 0x0203, 0x0205, 0x0206, 0x0207,
    0x0208, 0x0209, 0x0211, 0x0212, 0x0213, 0x0214, 0x02BC, 0x83BB, 0x8649};

constexpr std::size_t kSharedValues = 1 << 16;

} // namespace

const TagEntry* TagDirectory::find(std::uint16_t tag) const {
    const auto found =
        std::find_if(entries.begin(), entries.end(), [tag](const TagEntry& e) { return e.tag == tag; });
    return found == entries.end() ? nullptr : &*found;
}

std::size_t tagTypeSize(std::uint16_t type) {
    constexpr std::array<std::uint8_t, 19> sizes = {0, 1, 1, 2, 4, 8, 1, 1, 2, 4, 8, 4, 8, 4, 0, 0, 8, 8, 8};
    constexpr std::uint16_t utf8 = 129;
    return type < sizes.size() ? sizes.at(type) : type == utf8 ? 1 : 0;
}

std::uint16_t narrowTagType(std::uint16_t type) {
    switch (type) {
    case tiff::Long8:
        return tiff::Long;
    case tiff::SLong8:
        return tiff::SLong;
    case tiff::Ifd8:
        return tiff::Ifd;
    default:
        return type;
    }
}

bool leadsToExif(std::uint16_t tag) {
    return tag == tiff::ExifIfd || tag == tiff::GpsIfd || tag == tiff::InteropIfd;
}

TiffView::TiffView(ByteView bytes) : mBytes(bytes) {
    using namespace std::string_view_literals;
    mBig = startsWith(bytes, "II+\0\x08\0\0\0"sv) || startsWith(bytes, "MM\0+\0\x08\0\0"sv);
    mOrder = startsWith(bytes, "MM") ? ByteOrder::Big : ByteOrder::Little;
    if (!mBig && !startsWith(bytes, "II*\0"sv) && !startsWith(bytes, "MM\0*"sv))
        throw DamagedBytes("it does not begin with a byte order mark");
    slice(bytes, 0, headerSize());
}

TagEntry TiffView::entry(std::size_t place) const {
    TagEntry entry;
    entry.place = place;
    entry.tag = static_cast<std::uint16_t>(number(mBytes, place, 2, mOrder));
    entry.type = static_cast<std::uint16_t>(number(mBytes, place + 2, 2, mOrder));
    entry.count = offset(place + 4);
    entry.valueAt = place + 4 + offsetSize();
    const std::size_t each = tagTypeSize(entry.type);
    if (each == 0 || entry.count > mBytes.size() / each)
        return entry;
    if (entry.count * each > offsetSize())
        entry.valueAt = offset(entry.valueAt);
    if (entry.valueAt >= headerSize() && entry.valueAt <= mBytes.size() &&
        entry.count * each <= mBytes.size() - entry.valueAt)
        entry.value = mBytes.subspan(entry.valueAt, entry.count * each);
    return entry;
}

TagDirectory TiffView::directory(std::size_t place) const {
    if (place < headerSize())
        throw DamagedBytes("a directory stands in the header");
    const std::size_t countSize = mBig ? 8 : 2;
    const std::uint64_t count = number(mBytes, place, countSize, mOrder);
    if (count > mBytes.size() / entrySize())
        throw DamagedBytes("a directory is longer than the whole");
    TagDirectory directory;
    directory.place = place;
    std::size_t claimed = 0; // entries may share short values, but nobody stores much more than there is
    for (std::uint64_t i = 0; i < count; ++i) {
        directory.entries.push_back(entry(place + countSize + i * entrySize()));
        claimed += directory.entries.back().value.size();
        if (claimed > mBytes.size() + kSharedValues)
            throw DamagedBytes("a directory claims more values than there are");
    }
    directory.linkAt = place + countSize + count * entrySize();
    directory.size = directory.linkAt + offsetSize() - place;
    // Some cameras leave the last link out.
    if (directory.linkAt + offsetSize() <= mBytes.size())
        directory.next = offset(directory.linkAt);
    return directory;
}

TagChain TiffView::chain(std::size_t limit) const {
    TagChain chain;
    std::set<std::size_t> seen;
    try {
        for (std::size_t at = first(); at != 0 && chain.list.size() < limit; at = chain.list.back().next) {
            if (!seen.insert(at).second)
                throw DamagedBytes("its directories run in a circle");
            chain.list.push_back(directory(at));
        }
    } catch (const DamagedBytes&) {
        chain.complete = false;
    }
    return chain;
}

std::uint64_t TiffView::value(const TagEntry& entry, std::size_t index) const {
    const std::size_t each = tagTypeSize(entry.type);
    if (each == 0 || index >= entry.value.size() / each)
        throw DamagedBytes("a value lies behind the end");
    return number(entry.value, index * each, each, mOrder);
}

bool isTiffStructure(std::uint16_t tag) {
    return tag == tiff::IccProfile || tag == tiff::Layers ||
           std::binary_search(kStructure.begin(), kStructure.end(), tag);
}

} // namespace orvela
