#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// Longest Exif block and longest XMP packet that fit into a segment of their own.
inline constexpr std::size_t kJpegExifLimit = 65533 - 6;
inline constexpr std::size_t kJpegXmpLimit = 65533 - 29;

/// What the segments of a JPEG say.
Metadata readJpegMetadata(ByteView file);

/// Puts the metadata into an encoded JPEG, in place of what the encoder wrote, whose colour profile and Adobe
/// marker stay. A longer Exif block goes on in further segments. A longer XMP packet must have been made to
/// fit.
void embedIntoJpeg(const Metadata& metadata, Bytes& encoded);

} // namespace orvela
