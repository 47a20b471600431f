#pragma once

#include "files/FileFormat.h"

namespace orvela {

/// The whole content of a regular file.
/// @param most  bytes that it may have
/// @param left  bytes of memory that must be left
/// @throws PhotographError when it is missing, no regular file, too large or cannot be read
/// @throws MemoryError when the memory does not suffice
Bytes readWholeFile(const std::filesystem::path& path, std::uintmax_t most = UINTMAX_MAX,
                    std::uint64_t left = 0);

} // namespace orvela
