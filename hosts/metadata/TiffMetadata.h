#pragma once

#include "metadata/Metadata.h"
#include "metadata/TiffStructure.h"

namespace orvela {

/// What a page of a TIFF says. The Exif block is made of the tags that describe the picture; its maker note
/// keeps its distance from the beginning where that is below 64 KiB. Otherwise the metadata library makes the
/// block, as far as it understands the maker note.
/// @param page  offset of the page's directory; 0 for the first one
Metadata readTiffMetadata(ByteView file, std::size_t page = 0);

/// Puts the metadata into an encoded TIFF of one page or several, for the first of them. The Exif block
/// becomes the beginning of the file, so that all its offsets stay true; what the encoder wrote follows.
/// @return names of Exif tags that could not be kept, where the encoder's byte order is not the block's and
/// the
///         metadata library has to make the block anew
/// @throws DamagedBytes when the bytes are no TIFF, or the block is damaged
std::vector<std::string> embedIntoTiff(const Metadata& metadata, Bytes& encoded);

/// Names of the tags of the block that the first page of the TIFF does not have with the same bytes; a maker
/// note has to have its place, too.
std::vector<std::string> missingInTiff(const Metadata& metadata, ByteView encoded);

} // namespace orvela
