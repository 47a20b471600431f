#pragma once

#include "metadata/TiffStructure.h"

namespace orvela {

/// Whether a file holds the raw data of a camera's sensor in a format of its own.
/// @param head  the first 16 bytes of the file, or all
bool isCameraRaw(ByteView head);

/// Whether a TIFF is the shell of such data: DNG and what other makers have like it, whose first page is
/// often a small preview.
bool isCameraRaw(const TiffView& tiff);

} // namespace orvela
