#include "files/HeifBoxes.h"

#include <algorithm>
#include <array>
#include <map>
#include <string_view>

namespace orvela {

namespace {

using Items = std::vector<std::uint32_t>;

std::uint32_t idIn(Cursor& cursor, bool wide) {
    return static_cast<std::uint32_t>(cursor.number(wide ? 4 : 2));
}

struct Box {
    std::string_view type;
    ByteView content;
};

Box nextBox(Cursor& cursor) {
    const std::size_t whole = cursor.rest().size();
    std::uint64_t size = cursor.number(4);
    const ByteView type = cursor.take(4);
    if (size == 1)
        size = cursor.number(8);
    const std::size_t head = whole - cursor.rest().size();
    if (size == 0)
        size = whole; // up to the end
    if (size < head)
        throw DamagedBytes("a box is smaller than its head");
    return {asText(type), cursor.take(size - head)};
}

std::vector<Box> boxesOf(ByteView content) {
    std::vector<Box> boxes;
    for (Cursor cursor(content); !cursor.isAtEnd();)
        boxes.push_back(nextBox(cursor));
    return boxes;
}

// Does not look behind the box.
ByteView boxIn(ByteView content, std::string_view type) {
    for (Cursor cursor(content);;)
        if (const Box box = nextBox(cursor); box.type == type)
            return box.content;
}

/// The version of a full box and what follows version and flags.
struct FullBox {
    explicit FullBox(ByteView box) : content(box) {
        version = static_cast<int>(content.number(1));
        flags = content.number(3);
    }

    Cursor content;
    int version = 0;
    std::uint64_t flags = 0;
};

std::uint32_t primaryItem(ByteView pitm) {
    FullBox box(pitm);
    return idIn(box.content, box.version > 0);
}

// The items that an item is put together from, in order; none when it is coded itself.
Items partsOf(ByteView meta, std::uint32_t item) {
    for (const Box& candidate : boxesOf(meta)) {
        if (candidate.type != "iref")
            continue;
        FullBox box(candidate.content);
        const bool wide = box.version > 0;
        for (const Box& reference : boxesOf(box.content.rest())) {
            Cursor cursor(reference.content);
            if (reference.type != "dimg" || idIn(cursor, wide) != item)
                continue;
            Items parts(idIn(cursor, false));
            for (std::uint32_t& part : parts)
                part = idIn(cursor, wide);
            return parts;
        }
    }
    return {};
}

// The bytes that each item takes in the file.
std::map<std::uint32_t, std::uint64_t> itemSizes(ByteView iloc) {
    FullBox box(iloc);
    Cursor& cursor = box.content;
    const std::uint64_t fields = cursor.number(2);
    const auto width = [&](int field) { return fields >> (12 - 4 * field) & 15; };
    std::map<std::uint32_t, std::uint64_t> sizes;
    for (std::uint32_t count = idIn(cursor, box.version == 2); count > 0; --count) {
        const std::uint32_t item = idIn(cursor, box.version == 2);
        if (box.version > 0)
            cursor.take(2); // where the offsets count from
        cursor.take(2 + width(2));
        for (std::uint64_t extents = cursor.number(2); extents > 0; --extents) {
            cursor.take((box.version > 0 ? width(3) : 0) + width(0));
            sizes[item] += cursor.number(width(1));
        }
    }
    return sizes;
}

// The properties of an item, as numbers counted from 1.
Items propertiesOf(ByteView ipma, std::uint32_t item) {
    FullBox box(ipma);
    const bool wide = (box.flags & 1) != 0;
    for (std::uint64_t count = box.content.number(4); count > 0; --count) {
        const bool found = idIn(box.content, box.version > 0) == item;
        Items properties(box.content.number(1));
        for (std::uint32_t& property : properties)
            property = static_cast<std::uint32_t>(box.content.number(wide ? 2 : 1)) & (wide ? 0x7FFF : 0x7F);
        if (found)
            return properties;
    }
    return {};
}

std::vector<Box> chosen(const std::vector<Box>& all, const Items& numbers) {
    std::vector<Box> boxes;
    for (const std::uint32_t number : numbers)
        if (number > 0 && number <= all.size())
            boxes.push_back(all[number - 1]);
    return boxes;
}

Chroma chromaOf(const Box& configuration) {
    Cursor cursor(configuration.content);
    if (configuration.type == "av1C") {
        cursor.take(2);
        const std::uint64_t halves = cursor.number(1) >> 2 & 3; // both ways, horizontally
        return halves == 0 ? Chroma::Full : halves == 2 ? Chroma::HalfWidth : Chroma::Half;
    }
    cursor.take(16);
    const std::uint64_t format = cursor.number(1) & 3;
    return format == 3 ? Chroma::Full : format == 2 ? Chroma::HalfWidth : Chroma::Half;
}

// What tells how a picture is coded, shaped and turned, and what metadata speak of.
bool isKnown(const Box& property) {
    constexpr std::array<std::string_view, 12> names = {"ispe", "pixi", "hvcC", "av1C", "colr", "irot",
                                                        "imir", "clap", "auxC", "rloc", "lsel", "a1lx"};
    if (std::find(names.begin(), names.end(), property.type) != names.end())
        return true;
    Cursor cursor(property.content);
    return property.type == "pasp" && cursor.number(4) == cursor.number(4); // pixels are square anyway
}

HeifCoding codingOf(ByteView file) {
    const ByteView meta = FullBox(boxIn(file, "meta")).content.rest();
    const std::uint32_t primary = primaryItem(boxIn(meta, "pitm"));
    Items items = {primary};
    // A picture of tiles may itself be turned or framed by another item.
    for (int depth = 0; depth < 3; ++depth) {
        Items parts = partsOf(meta, items[0]);
        if (parts.empty())
            break;
        items = std::move(parts);
    }
    HeifCoding coding;
    auto sizes = itemSizes(boxIn(meta, "iloc"));
    for (const std::uint32_t item : items)
        coding.bytes += sizes[item];
    const ByteView properties = boxIn(meta, "iprp");
    const std::vector<Box> all = boxesOf(boxIn(properties, "ipco"));
    const ByteView ipma = boxIn(properties, "ipma");
    for (const Box& property : chosen(all, propertiesOf(ipma, items[0])))
        if (property.type == "hvcC" || property.type == "av1C") {
            coding.isAv1 = property.type == "av1C";
            coding.chroma = chromaOf(property);
            coding.mostPixelsPerByte = coding.isAv1 ? bounds::kNone : bounds::kHevc;
        }
    for (const Box& property : chosen(all, propertiesOf(ipma, primary)))
        if (!isKnown(property))
            coding.otherProperties.emplace_back(property.type);
    return coding;
}

// Of a track of the kind that is no film.
int framesOf(ByteView track) {
    const ByteView media = boxIn(track, "mdia");
    Cursor handler(boxIn(media, "hdlr"));
    handler.take(8);
    constexpr std::uint32_t picture = 0x70696374; // "pict"
    if (handler.number(4) != picture)
        return 0;
    Cursor sizes(boxIn(boxIn(boxIn(media, "minf"), "stbl"), "stsz"));
    sizes.take(8);
    return static_cast<int>(std::min<std::uint64_t>(sizes.number(4), INT32_MAX));
}

} // namespace

std::optional<HeifCoding> heifCoding(ByteView file) {
    try {
        return codingOf(file);
    } catch (const DamagedBytes&) {
        return std::nullopt;
    }
}

HeifPictures heifPictures(ByteView file) {
    HeifPictures pictures;
    try {
        for (Cursor cursor(file); !cursor.isAtEnd();) {
            const Box box = nextBox(cursor);
            pictures.still = pictures.still || box.type == "meta";
            if (box.type == "moov")
                for (const Box& track : boxesOf(box.content))
                    if (track.type == "trak")
                        pictures.frames = std::max(pictures.frames, framesOf(track.content));
        }
    } catch (const DamagedBytes&) {
        // What was found before stays found.
    }
    return pictures;
}

} // namespace orvela
