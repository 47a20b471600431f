#pragma once

#include "files/Photograph.h"
#include "metadata/ExifBlock.h"

namespace orvela {

/// Makes thumbnails of a photograph, in sRGB: the whole picture, between black bars where its shape is not
/// the thumbnail's. Refers to the photograph.
ThumbnailMaker thumbnailsOf(const Photograph& photograph);

} // namespace orvela
