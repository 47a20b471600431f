#pragma once

#include "files/DeclaredPicture.h"
#include "files/TiffFile.h"

namespace orvela {

/// Decodes a page, counted from 0, with all that its directory says. A mask is read as it stands.
/// @throws PhotographError when it is damaged or a picture that the filter cannot take; as checkPicture()
Photograph readTiffPage(SourceFile& file, const TiffFile& tiff, int index, const ReadLimits& limits);

} // namespace orvela
