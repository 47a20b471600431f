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

} // namespace orvela
