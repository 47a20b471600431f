#pragma once

#include "files/PhotographWriter.h"

namespace orvela {

/// The picture as the bytes of a HEIF file with its ICC profile.
/// Compression, chroma, bit depth, the bytes per pixel or that there is no loss are those of a HEIF source
/// where the options and the target's extension say nothing. Readers turn the picture by properties of its
/// own, not by Exif, so that it gets these. A child process encodes.
/// @param photograph  RGB with or without transparency
/// @param target      for messages; .avif asks for AV1 compression, .heic for HEVC
/// @param metadata    its Exif and XMP, codes of colours and whether there is to be a thumbnail
/// @throws PhotographError when the picture cannot be encoded
/// @throws StoppedError when `options.stop` was set
/// @throws std::bad_alloc
Bytes encodeHeif(const Photograph& photograph, const std::filesystem::path& target,
                 const WriteOptions& options, const Metadata& metadata);

/// Bytes of memory that encoding takes at the most beside the photograph, in all processes.
std::uint64_t heifEncoderBytes(const Photograph& photograph, const std::filesystem::path& target);

} // namespace orvela
