#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the chunks of a WebP say.
Metadata readWebPMetadata(ByteView file);

/// How a WebP holds its pictures.
struct WebPPictures {
    int frames = 1;        ///< of an animation
    bool lossless = false; ///< the first one is coded without loss
};
WebPPictures webpPictures(ByteView file);

/// Puts the metadata into an encoded WebP, in place of what the encoder wrote, whose colour profile stays.
/// @throws DamagedBytes when the bytes are no WebP
void embedIntoWebP(const Metadata& metadata, Bytes& encoded);

} // namespace orvela
