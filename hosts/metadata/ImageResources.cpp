#include "metadata/ImageResources.h"

#include "metadata/JpegSegments.h"

#include <algorithm>

namespace orvela {

namespace {

constexpr std::size_t kThumbnailHead = 28;

// Other programs put resources of their own between Photoshop's.
bool isSignature(ByteView bytes) {
    constexpr std::string_view known[] = {"8BIM", "PHUT", "AgHg", "DCSR", "MeSa"};
    return std::any_of(std::begin(known), std::end(known),
                       [&](std::string_view text) { return startsWith(bytes, text); });
}

ImageResource firstOf(ByteView list) {
    if (!isSignature(list))
        throw DamagedBytes("it does not begin with a known signature");
    ImageResource resource;
    resource.id = static_cast<std::uint16_t>(number(list, 4, 2, ByteOrder::Big));
    const std::size_t name = number(list, 6, 1, ByteOrder::Big);
    const std::size_t head = 6 + (name + 2) / 2 * 2 + 4;
    const std::size_t size = number(list, head - 4, 4, ByteOrder::Big);
    resource.data = slice(list, head, size);
    resource.whole = list.first(std::min(list.size(), head + size + size % 2));
    return resource;
}

// Some programs count the length of IPTC in fours, with zeros behind the last record.
ByteView significant(const ImageResource& resource) {
    ByteView data = resource.data;
    while (resource.id == resource::Iptc && !data.empty() && data.back() == 0)
        data = data.first(data.size() - 1);
    return data;
}

bool sameData(const ImageResource& a, const ImageResource& b) {
    return sameBytes(significant(a), significant(b));
}

Bytes thumbnailResource(const JpegSize& size, ByteView jpeg) {
    const auto width = static_cast<std::uint64_t>(size.width);
    const std::uint64_t row = (width * 24 + 31) / 32 * 4;
    Bytes data;
    const auto add = [&](std::uint64_t value, std::size_t bytes) {
        append(data, value, bytes, ByteOrder::Big);
    };
    add(1, 4); // JPEG
    add(width, 4);
    add(static_cast<std::uint64_t>(size.height), 4);
    add(row, 4);
    add(row * static_cast<std::uint64_t>(size.height), 4);
    add(jpeg.size(), 4);
    add(24, 2); // bits per pixel
    add(1, 2);  // planes
    append(data, jpeg);
    return data;
}

} // namespace

const ImageResource* ImageResources::find(std::uint16_t id) const {
    const auto found =
        std::find_if(list.begin(), list.end(), [id](const ImageResource& one) { return one.id == id; });
    return found == list.end() ? nullptr : &*found;
}

ImageResources imageResources(ByteView list) {
    ImageResources resources;
    try {
        while (!list.empty()) {
            resources.list.push_back(firstOf(list));
            list = behind(list, resources.list.back().whole.size());
        }
    } catch (const DamagedBytes&) {
        // Zeros fill up what a program counts in fours.
        if (!std::all_of(list.begin(), list.end(), [](std::uint8_t byte) { return byte == 0; }))
            resources.rest = list;
    }
    return resources;
}

Bytes withoutResources(ByteView list, const std::vector<std::uint16_t>& ids) {
    const ImageResources resources = imageResources(list);
    Bytes kept;
    for (const ImageResource& one : resources.list)
        if (std::find(ids.begin(), ids.end(), one.id) == ids.end())
            append(kept, one.whole);
    append(kept, resources.rest);
    return kept;
}

void appendResource(Bytes& list, std::uint16_t id, ByteView data) {
    append(list, "8BIM");
    append(list, id, 2, ByteOrder::Big);
    append(list, 0, 2, ByteOrder::Big); // no name
    append(list, data.size(), 4, ByteOrder::Big);
    append(list, data);
    if (data.size() % 2 == 1)
        list.push_back(0);
}

void addResources(Bytes& list, ByteView more) {
    if (list.empty()) {
        list = copyOf(more);
        return;
    }
    const ImageResources added = imageResources(more);
    Bytes missing;
    {
        const ImageResources there = imageResources(list);
        const auto isThere = [&](const ImageResource& one) {
            return std::any_of(there.list.begin(), there.list.end(), [&](const ImageResource& other) {
                return other.id == one.id && sameData(other, one);
            });
        };
        for (const ImageResource& one : added.list)
            if (!isThere(one))
                append(missing, one.whole);
        if (!sameBytes(added.rest, there.rest))
            append(missing, added.rest);
        if (there.rest.empty())
            padToEven(list);
    }
    append(list, missing);
}

bool sameResources(ByteView a, ByteView b) {
    const auto sorted = [](ByteView list) {
        std::vector<std::pair<std::uint16_t, std::string_view>> all;
        const ImageResources resources = imageResources(list);
        for (const ImageResource& one : resources.list) {
            const std::string_view text = asText(significant(one));
            if (one.id != resource::Iptc || !text.empty())
                all.emplace_back(one.id, text);
        }
        all.emplace_back(0, asText(resources.rest));
        std::sort(all.begin(), all.end());
        return all;
    };
    return sorted(a) == sorted(b);
}

std::optional<Density> resourceDensity(ByteView list) {
    const ImageResources resources = imageResources(list);
    const ImageResource* found = resources.find(resource::ResolutionInfo);
    if (found == nullptr || found->data.size() < 16)
        return std::nullopt;
    // 16.16 pixels per inch, whatever unit is shown. Some writers put the least there is where they know
    // none.
    const auto value = [&](std::size_t at) {
        const auto fixed = static_cast<std::uint32_t>(number(found->data, at, 4, ByteOrder::Big));
        return fixed <= 1           ? Rational{0, 1}
               : fixed % 65536 == 0 ? Rational{fixed / 65536, 1}
                                    : Rational{fixed, 65536};
    };
    const Density density{value(0), value(8), DensityUnit::Inch};
    return density.isMeant() ? std::optional(density) : std::nullopt;
}

bool renewResourceThumbnail(Bytes& list, const ThumbnailMaker& make) {
    constexpr int quality = 80;
    const std::vector<std::uint16_t> ids = {resource::Thumbnail, resource::ThumbnailBgr};
    Bytes jpeg;
    Bytes renewed;
    {
        const ImageResources resources = imageResources(list);
        const ImageResource* old = resources.find(resource::Thumbnail);
        if (old == nullptr)
            old = resources.find(resource::ThumbnailBgr);
        if (old == nullptr)
            return true;
        const auto size = jpegSize(old->data.subspan(std::min(kThumbnailHead, old->data.size())));
        if (size && isThumbnailSize(*size))
            jpeg = make(size->width, size->height, quality);
        renewed = withoutResources(list, ids);
        if (!jpeg.empty())
            appendResource(renewed, resource::Thumbnail, thumbnailResource(*size, jpeg));
    }
    list = std::move(renewed);
    return !jpeg.empty();
}

} // namespace orvela
