#pragma once

#include "metadata/ExifBlock.h"

namespace orvela {

/// Makes the previews anew, in their size and place, that stand in the maker note of an Exif block or where
/// it refers to; one that cannot be made is overwritten with zeros. They are found by their bytes, since
/// every maker tells of them in its own way.
/// @param turned  swaps the edges
/// @return whether all could be made
bool renewNotePreviews(Bytes& block, const ThumbnailMaker& make, bool turned);

} // namespace orvela
