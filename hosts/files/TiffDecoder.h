#pragma once

#include "files/LibTiff.h"
#include "files/Photograph.h"

namespace orvela {

/// Size, profile and samples of a TIFF's first page.
/// @param path  for messages
/// @throws what the stream threw; PhotographError
Photograph decodeTiff(TiffStream& tiff, const std::filesystem::path& path);

} // namespace orvela
