#pragma once

#include "metadata/TiffStructure.h"

namespace orvela {

/// One field of a directory; the value in the file's byte order. Tags and types have the names of libtiff's
/// <tiff.h>.
struct TiffField {
    std::uint16_t tag = 0;
    std::uint16_t type = 0;
    Bytes value;                    ///< a whole number of values of that type
    std::size_t offset = 0;         ///< where it stands in the file that it was read from; 0 for none
    std::vector<TiffField> below{}; ///< of a pointer: the fields of the directory that it leads to
};

/// One page of a TIFF as its directory tells it.
struct TiffPage {
    ByteOrder order = ByteOrder::Little;
    std::vector<TiffField> fields;      ///< but for Photoshop's layers, of which metadata tell
    std::vector<std::uint16_t> damaged; ///< tags of fields without a value or of an unknown type
    std::vector<Bytes> blocks; ///< strips or tiles as they stand, of a page that is to be copied; else empty

    const TiffField* find(std::uint16_t tag) const;
    /// The values of a field of whole numbers; empty when it is missing or of another kind.
    std::vector<std::uint64_t> numbers(std::uint16_t tag) const;
    /// The first of them, or the number given when there is none.
    std::uint64_t number(std::uint16_t tag, std::uint64_t otherwise) const;
};

/// A field of a file that is in view.
TiffField tiffField(const TagEntry& entry);

/// A field of whole numbers of that type.
TiffField tiffField(std::uint16_t tag, std::uint16_t type, const std::vector<std::uint64_t>& values,
                    ByteOrder order);

/// The values of a field of whole numbers; empty for other kinds.
std::vector<std::uint64_t> tiffNumbers(const TiffField& field, ByteOrder order);

} // namespace orvela
