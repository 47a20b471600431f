#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What a file says beside its picture. Damaged parts travel as they stand, or are named.
Metadata readMetadata(ByteView file, FileFormat format);

/// What the container says of the density, otherwise what Exif says.
std::optional<Density> densityOf(const Metadata& metadata);

} // namespace orvela
