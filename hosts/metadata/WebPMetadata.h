#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the chunks of a WebP say.
Metadata readWebPMetadata(ByteView file);

/// Puts the metadata into an encoded WebP, in place of what the encoder wrote, whose colour profile stays.
/// @throws DamagedBytes when the bytes are no WebP
void embedIntoWebP(const Metadata& metadata, Bytes& encoded);

} // namespace orvela
