#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What a file says beside its picture. Damaged parts travel as they stand, or are named.
/// @param page  where the directory of a TIFF's page stands; 0 for the first one
Metadata readMetadata(ByteView file, FileFormat format, std::size_t page = 0);

/// What the container says of the density, otherwise what Exif says.
std::optional<Density> densityOf(const Metadata& metadata);

} // namespace orvela
