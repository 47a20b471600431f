#pragma once

#include "common/Metadata.h"

namespace orvela {

/// Exif (from its byte order mark on) and XMP of a HEIF file or its bytes; empty where it has none. The
/// metadata library does not find them in every HEIF, the decoder does.
MetadataBlocks heifMetadata(const std::filesystem::path& path);
MetadataBlocks heifMetadata(ByteView file);

} // namespace orvela
