#pragma once

#include "files/Photograph.h"
#include "files/TiffPage.h"

namespace orvela {

/// The fields of a photograph's page in a TIFF, beside those of its storage: what its metadata make, its
/// profile and, if it comes from a TIFF, whatever else its page holds. Values of the Exif block have their
/// offsets in it.
/// @param metadata  ready for a TIFF
/// @param lost      takes the names of what the page held and cannot keep
std::vector<TiffField> pageFields(const Photograph& photograph, const Metadata& metadata, ByteOrder order,
                                  std::vector<std::string>& lost);

/// The fields of a page that is copied with its strips or tiles: all but those that lead to other places.
/// @param lost  takes the names of what they lead to
std::vector<TiffField> copiedFields(const TiffPage& page, std::vector<std::string>& lost);

} // namespace orvela
