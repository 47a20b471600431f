#pragma once

#include "files/FileFormat.h"

#include <memory>
#include <string>
#include <vector>

namespace orvela {

/// Exif, from its byte order mark on, and XMP as they stand in a file.
struct MetadataBlocks {
    Bytes exif;
    Bytes xmp;
};

/// Takes the metadata out of a file, to travel with its picture. When it cannot be read, copyMetadata tells.
std::shared_ptr<const Metadata> readMetadata(ByteView file, FileFormat format);

/// Both out of the photograph's metadata, for a format whose encoder embeds them; empty where it has none.
MetadataBlocks metadataBlocks(const Photograph& photograph);

/// Gives an encoded picture the photograph's metadata, Exif (with MakerNote), XMP, IPTC and comment, and
/// reads it back. Tags that describe how the samples are stored stay those of the encoded picture, further
/// pages of a TIFF are not carried over, and the dimensions are the picture's. XMP goes over as it stands,
/// well-formed or not. The orientation is kept, except that it is upright for a HEIF source, whose decoding
/// turns the pixels.
/// @param encoded  changed in place; left as it is when nothing can be added
/// @return one warning for each kind of metadata that is damaged or did not arrive
std::vector<std::string> copyMetadata(const Photograph& photograph, FileFormat target, Bytes& encoded);

} // namespace orvela
