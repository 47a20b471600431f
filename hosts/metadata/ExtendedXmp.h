#pragma once

#include "metadata/Metadata.h"

// An XMP packet that is too long for one segment of a JPEG: a main packet that refers to another one, which
// is parted over further segments.

namespace orvela {

/// Name of the further segments.
inline constexpr char kExtendedXmp[] = "extended XMP";

struct PartedXmp {
    Bytes main;
    std::vector<Chunk> segments;
};

/// Parts a packet; all of it goes into the segments. None when it is no XMP.
std::optional<PartedXmp> partXmp(ByteView packet);

/// One packet of both. None when a segment is missing or they do not fit together.
/// @param segments  others may be among them
std::optional<Bytes> joinXmp(ByteView main, const std::vector<Chunk>& segments);

} // namespace orvela
