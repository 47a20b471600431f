#pragma once

#include "files/PhotographWriter.h"

namespace orvela {

/// The picture as the bytes of a HEIF file with its ICC profile and the Exif and XMP of `metadata`.
/// Compression, chroma, bit depth and the bytes per pixel are those of a HEIF source where the options say
/// nothing. A child process encodes.
/// @param photograph  RGB with or without transparency
/// @param target      for messages; .avif asks for AV1 compression
/// @throws PhotographError when the picture cannot be encoded
/// @throws StoppedError when `options.stop` was set
/// @throws std::bad_alloc
Bytes encodeHeif(const Photograph& photograph, const std::filesystem::path& target,
                 const WriteOptions& options, const Metadata& metadata);

} // namespace orvela
