#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the chunks of a PNG say.
Metadata readPngMetadata(ByteView file);

/// Puts the metadata into an encoded PNG, in place of what the encoder wrote, whose colour profile stays.
void embedIntoPng(const Metadata& metadata, Bytes& encoded);

/// Whether the chunk tells what every reader takes for granted without it: the colours of sRGB.
bool isPlainColour(const Chunk& chunk);

} // namespace orvela
