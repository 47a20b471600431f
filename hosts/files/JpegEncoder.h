#pragma once

#include "files/PhotographWriter.h"

namespace orvela {

/// The picture as the bytes of a JPEG file with its ICC profile. Colour kind, sampling,
/// quantization tables and progression are those of a JPEG source where the options say nothing.
/// @param photograph  8 bits, without transparency
/// @param target      for messages
/// @throws PhotographError when the picture cannot be encoded
/// @throws StoppedError when `options.stop` was set
/// @throws std::bad_alloc
Bytes encodeJpeg(const Photograph& photograph, const std::filesystem::path& target,
                 const WriteOptions& options);

} // namespace orvela
