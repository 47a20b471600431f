#pragma once

#include "files/PhotographWriter.h"

namespace orvela {

/// The picture as the bytes of a file of that format, not TIFF, with its ICC profile. Only HEIF, to which
/// nothing can be added afterwards, gets its Exif and XMP, out of `metadata`, already here.
/// @param target  for messages; .avif asks for AV1 compression
/// @throws PhotographError when the picture cannot be encoded or a setting is unknown
/// @throws StoppedError when `options.stop` was set
Bytes encodePhotograph(const Photograph& photograph, FileFormat format, const std::filesystem::path& target,
                       const WriteOptions& options, const Metadata& metadata);

/// Bytes of memory that encoding takes beside the photograph, at the most: as measured with pictures of 1 to
/// 24 megapixels.
std::uint64_t encoderBytes(const Photograph& photograph, FileFormat format,
                           const std::filesystem::path& target, const WriteOptions& options);

} // namespace orvela
