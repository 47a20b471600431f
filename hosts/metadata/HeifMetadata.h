#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the items of a HEIF say; its pictures beside the first are among what cannot travel.
Metadata readHeifMetadata(ByteView file);

} // namespace orvela
