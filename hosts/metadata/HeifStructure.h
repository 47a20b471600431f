#pragma once

#include "metadata/Bytes.h"

#include <map>

// The boxes that a HEIF is made of.

namespace orvela {

struct HeifBox {
    std::string_view type; ///< four letters
    ByteView content;
};

/// Takes a box off the front. @throws DamagedBytes when it is not whole
HeifBox nextHeifBox(Cursor& cursor);

/// All boxes of a content. @throws DamagedBytes when the last is not whole
std::vector<HeifBox> heifBoxes(ByteView content);

/// The content of the first box of that type; does not look behind it. @throws DamagedBytes without one
ByteView heifBoxIn(ByteView content, std::string_view type);

/// The version of a full box and what follows version and flags.
struct HeifFullBox {
    /// @throws DamagedBytes when it is too short
    explicit HeifFullBox(ByteView box) : content(box) {
        version = static_cast<int>(content.number(1));
        flags = content.number(3);
    }

    Cursor content;
    int version = 0;
    std::uint64_t flags = 0;
};

/// The number of an item, of four bytes or two.
inline std::uint32_t heifId(Cursor& cursor, bool wide) {
    return static_cast<std::uint32_t>(cursor.number(wide ? 4 : 2));
}

/// What the box that tells of the items holds. @throws DamagedBytes without one
ByteView heifMeta(ByteView file);

/// The item that is the picture. @throws DamagedBytes where it is not told
std::uint32_t primaryHeifItem(ByteView meta);

struct HeifItem {
    std::uint32_t id = 0;
    std::string_view type; ///< four letters; empty where it has none
};

/// The items that are listed. @throws DamagedBytes without a whole list
std::vector<HeifItem> heifItems(ByteView meta);

/// By each item the ones, in order, that it refers to by a reference of that kind ("dimg": it is put together
/// from them, "cdsc": it describes them). @throws DamagedBytes when references are not whole
std::map<std::uint32_t, std::vector<std::uint32_t>> heifReferences(ByteView meta, std::string_view kind);

} // namespace orvela
