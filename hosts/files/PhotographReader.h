#pragma once

#include "files/DeclaredPicture.h"
#include "files/Photograph.h"

namespace orvela {

/// Reads a JPEG, PNG, TIFF, WebP, PSD or HEIF file, recognised by its content: 8 or 16 bits; grey, grey with
/// transparency, RGB, RGB with transparency, CMYK. Palettes become RGB, bitmaps 8-bit grey, HEIF of 10 and 12
/// bits 16 bits. The orientation tag is not applied to the pixels, except by HEIF decoding, which always
/// turns them upright. Of a file with several pages or frames the first is read; of a PSD the merged picture.
/// @throws PhotographError when the file is missing, a folder, empty, cut short, unreadable, no picture, or a
///         picture that the filter cannot take: over 32767 pixels wide or high, more than four channels,
///         floating point samples, Lab and other colour models, more pixels than the limit
/// @throws MemoryError, std::bad_alloc when the memory does not suffice
Photograph readPhotograph(const std::filesystem::path& path, const ReadLimits& limits = {});

} // namespace orvela
