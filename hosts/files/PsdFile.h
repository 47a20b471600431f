#pragma once

#include "files/DeclaredPicture.h"
#include "files/FileFormat.h"

namespace orvela {

/// Reads the merged picture of a PSD file: bitmap, grey, palette, RGB and CMYK, 8 or 16 bits, with at most
/// one transparency channel beside grey or RGB, stored plainly or packed by runs. Inks, which the file
/// inverts, are turned back.
/// @param path  for messages and as the source of the result
/// @throws PhotographError for files that are cut short or hold another kind of picture, and as
/// checkPicture()
Photograph readPsd(ByteView file, const std::filesystem::path& path, const ReadLimits& limits);

} // namespace orvela
