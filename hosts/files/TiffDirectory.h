#pragma once

#include "files/FileFormat.h"

#include <vector>

namespace orvela {

/// One tag of a TIFF directory with its value as little-endian bytes.
struct TiffEntry {
    std::uint16_t tag;
    std::uint16_t type;
    std::uint32_t count; ///< values of that type
    Bytes value;
};

/// Adds tags to the first directory of a classic little-endian TIFF, which then stands at the file's end.
/// Tags that it has already stay as they are; other kinds of files are left alone.
void addTiffEntries(Bytes& file, const std::vector<TiffEntry>& entries);

} // namespace orvela
