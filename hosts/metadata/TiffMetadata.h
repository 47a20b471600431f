#pragma once

#include "metadata/ExifBlock.h"
#include "metadata/TiffStructure.h"

namespace orvela {

/// What a page of a TIFF says. The Exif block is made of the tags that describe the picture; its maker note
/// keeps its distance from the beginning where that is below 64 KiB. Otherwise the metadata library makes the
/// block, as far as it understands the maker note.
/// @param page  offset of the page's directory; 0 for the first one
Metadata readTiffMetadata(ByteView file, std::size_t page = 0);

/// The fields of a TIFF page for what has tags of its own there, beside the Exif block: XMP, IPTC,
/// Photoshop's resources, the density.
std::vector<TagField> tiffFields(const Metadata& metadata, ByteOrder order);

} // namespace orvela
