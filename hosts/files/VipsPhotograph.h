#pragma once

#include "files/FileFormat.h"
#include "files/Vips.h"

// Photographs of what libvips decodes.

namespace orvela {

/// Size, colour model, depth and profile of the image.
/// @param path  for messages
/// @throws PhotographError when the filter cannot take such a picture
Photograph describeImage(const std::filesystem::path& path, VipsImage* image);

/// Decodes the samples. @throws PhotographError
void takeSamples(Photograph& photograph, const std::filesystem::path& path, VipsImage* image);

} // namespace orvela
