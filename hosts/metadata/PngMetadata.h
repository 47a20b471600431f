#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the chunks of a PNG say.
Metadata readPngMetadata(ByteView file);

/// Puts the metadata into an encoded PNG, in place of what the encoder wrote, whose colour profile stays.
void embedIntoPng(const Metadata& metadata, Bytes& encoded);

/// Whether there is an ICC profile in it.
bool hasPngProfile(ByteView file);

/// Texts as PNG chunks.
std::vector<Chunk> pngTexts(const std::vector<Text>& texts);

/// Whether the chunk tells what every reader takes for granted without it: the colours of sRGB.
bool isPlainColour(const Chunk& chunk);

} // namespace orvela
