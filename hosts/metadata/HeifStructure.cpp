#include "metadata/HeifStructure.h"

namespace orvela {

HeifBox nextHeifBox(Cursor& cursor) {
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

std::vector<HeifBox> heifBoxes(ByteView content) {
    std::vector<HeifBox> boxes;
    for (Cursor cursor(content); !cursor.isAtEnd();)
        boxes.push_back(nextHeifBox(cursor));
    return boxes;
}

ByteView heifBoxIn(ByteView content, std::string_view type) {
    for (Cursor cursor(content);;)
        if (const HeifBox box = nextHeifBox(cursor); box.type == type)
            return box.content;
}

ByteView heifMeta(ByteView file) {
    return HeifFullBox(heifBoxIn(file, "meta")).content.rest();
}

std::uint32_t primaryHeifItem(ByteView meta) {
    HeifFullBox box(heifBoxIn(meta, "pitm"));
    return heifId(box.content, box.version > 0);
}

std::vector<HeifItem> heifItems(ByteView meta) {
    HeifFullBox list(heifBoxIn(meta, "iinf"));
    list.content.number(list.version == 0 ? 2 : 4); // how many
    std::vector<HeifItem> items;
    for (const HeifBox& box : heifBoxes(list.content.rest())) {
        if (box.type != "infe")
            continue;
        HeifFullBox entry(box.content);
        HeifItem& item = items.emplace_back();
        item.id = heifId(entry.content, entry.version > 2);
        entry.content.take(2); // protection
        if (entry.version >= 2)
            item.type = asText(entry.content.take(4));
    }
    return items;
}

std::map<std::uint32_t, std::vector<std::uint32_t>> heifReferences(ByteView meta, std::string_view kind) {
    std::map<std::uint32_t, std::vector<std::uint32_t>> found;
    for (const HeifBox& candidate : heifBoxes(meta)) {
        if (candidate.type != "iref")
            continue;
        HeifFullBox box(candidate.content);
        const bool wide = box.version > 0;
        for (const HeifBox& reference : heifBoxes(box.content.rest())) {
            if (reference.type != kind)
                continue;
            Cursor cursor(reference.content);
            std::vector<std::uint32_t>& items = found[heifId(cursor, wide)];
            for (std::uint64_t count = cursor.number(2); count > 0; --count)
                items.push_back(heifId(cursor, wide));
        }
    }
    return found;
}

} // namespace orvela
