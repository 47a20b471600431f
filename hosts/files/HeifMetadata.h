#pragma once

#include "files/Metadata.h"

namespace orvela {

/// Exif (from its byte order mark on) and XMP of a HEIF file; empty where it has none. The metadata library
/// does not find them in every HEIF, the decoder does.
/// @throws PhotographError for a file that cannot be decoded
MetadataBlocks heifMetadata(ByteView file);

} // namespace orvela
