#include "files/HeifBoxes.h"

#include "files/HevcParameters.h"
#include "metadata/HeifStructure.h"

#include <algorithm>
#include <array>
#include <map>

namespace orvela {

namespace {

using Items = std::vector<std::uint32_t>;

// The bytes that each item takes in the file.
std::map<std::uint32_t, std::uint64_t> itemSizes(ByteView iloc) {
    HeifFullBox box(iloc);
    Cursor& cursor = box.content;
    const std::uint64_t fields = cursor.number(2);
    const auto width = [&](int field) { return fields >> (12 - 4 * field) & 15; };
    std::map<std::uint32_t, std::uint64_t> sizes;
    for (std::uint32_t count = heifId(cursor, box.version == 2); count > 0; --count) {
        const std::uint32_t item = heifId(cursor, box.version == 2);
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
    HeifFullBox box(ipma);
    const bool wide = (box.flags & 1) != 0;
    for (std::uint64_t count = box.content.number(4); count > 0; --count) {
        const bool found = heifId(box.content, box.version > 0) == item;
        Items properties(box.content.number(1));
        for (std::uint32_t& property : properties)
            property = static_cast<std::uint32_t>(box.content.number(wide ? 2 : 1)) & (wide ? 0x7FFF : 0x7F);
        if (found)
            return properties;
    }
    return {};
}

std::vector<HeifBox> chosen(const std::vector<HeifBox>& all, const Items& numbers) {
    std::vector<HeifBox> boxes;
    for (const std::uint32_t number : numbers)
        if (number > 0 && number <= all.size())
            boxes.push_back(all[number - 1]);
    return boxes;
}

Chroma chromaOf(const HeifBox& configuration) {
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
bool isKnown(const HeifBox& property) {
    constexpr std::array<std::string_view, 12> names = {"ispe", "pixi", "hvcC", "av1C", "colr", "irot",
                                                        "imir", "clap", "auxC", "rloc", "lsel", "a1lx"};
    if (std::find(names.begin(), names.end(), property.type) != names.end())
        return true;
    Cursor cursor(property.content);
    return property.type == "pasp" && cursor.number(4) == cursor.number(4); // pixels are square anyway
}

HeifCoding codingOf(ByteView file) {
    const ByteView meta = heifMeta(file);
    const std::uint32_t primary = primaryHeifItem(meta);
    const auto derived = heifReferences(meta, "dimg");
    Items items = {primary};
    // A picture of tiles may itself be turned or framed by another item.
    for (int depth = 0; depth < 3; ++depth) {
        const auto parts = derived.find(items[0]);
        if (parts == derived.end() || parts->second.empty())
            break;
        items = parts->second;
    }
    HeifCoding coding;
    auto sizes = itemSizes(heifBoxIn(meta, "iloc"));
    for (const std::uint32_t item : items)
        coding.bytes += sizes[item];
    const ByteView properties = heifBoxIn(meta, "iprp");
    const std::vector<HeifBox> all = heifBoxes(heifBoxIn(properties, "ipco"));
    const ByteView ipma = heifBoxIn(properties, "ipma");
    for (const HeifBox& property : chosen(all, propertiesOf(ipma, items[0])))
        if (property.type == "hvcC" || property.type == "av1C") {
            coding.isAv1 = property.type == "av1C";
            coding.chroma = chromaOf(property);
            coding.lossless = !coding.isAv1 && isLosslessHevc(property.content);
            coding.mostPixelsPerByte = coding.isAv1 ? bounds::kNone : bounds::kHevc;
        }
    for (const HeifBox& property : chosen(all, propertiesOf(ipma, primary)))
        if (!isKnown(property))
            coding.otherProperties.emplace_back(property.type);
    return coding;
}

// Of a track of the kind that is no film.
int framesOf(ByteView track) {
    const ByteView media = heifBoxIn(track, "mdia");
    Cursor handler(heifBoxIn(media, "hdlr"));
    handler.take(8);
    constexpr std::uint32_t picture = 0x70696374; // "pict"
    if (handler.number(4) != picture)
        return 0;
    Cursor sizes(heifBoxIn(heifBoxIn(heifBoxIn(media, "minf"), "stbl"), "stsz"));
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
            const HeifBox box = nextHeifBox(cursor);
            pictures.still = pictures.still || box.type == "meta";
            if (box.type == "moov")
                for (const HeifBox& track : heifBoxes(box.content))
                    if (track.type == "trak")
                        pictures.frames = std::max(pictures.frames, framesOf(track.content));
        }
    } catch (const DamagedBytes&) {
        // What was found before stays found.
    }
    return pictures;
}

} // namespace orvela
