#pragma once

#include "files/DeclaredPicture.h"
#include "files/FileFormat.h"

namespace orvela {

/// Reads the primary picture of a HEIF: 8 bits, or 10 and 12 bits as 16, turned upright as the file says. A
/// child process decodes it.
/// @param path  for messages and as the source of the result
/// @throws PhotographError for files that are cut short or damaged
/// @throws MemoryError, std::bad_alloc
Photograph readHeif(ByteView file, const std::filesystem::path& path, const ReadLimits& limits = {});

} // namespace orvela
