#pragma once

#include "files/DeclaredPicture.h"
#include "files/FileFormat.h"

namespace orvela {

/// Reads a JPEG: grey, YCbCr, RGB, CMYK or YCCK, with its ICC profile, JFIF density and layout.
/// @param path  for messages and as the source of the result
/// @throws PhotographError for files that are cut short, damaged or hold another kind of picture
/// @throws MemoryError, std::bad_alloc
Photograph readJpeg(ByteView file, const std::filesystem::path& path, const ReadLimits& limits = {});

} // namespace orvela
