#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the chunks of a PNG say.
Metadata readPngMetadata(ByteView file);

/// Puts the metadata into an encoded PNG, in place of what the encoder wrote, whose colour profile stays.
void embedIntoPng(const Metadata& metadata, Bytes& encoded);

/// Whether there is a chunk of that name, whole.
bool hasPngChunk(ByteView file, std::string_view name);

/// Number of pictures of an animated PNG that are shown one after the other; 1 for a still one.
int pngFrames(ByteView file);

/// Texts as PNG chunks.
std::vector<Chunk> pngTexts(const std::vector<Text>& texts);

/// Whether the chunk tells what every reader takes for granted without it: the colours of sRGB.
bool isPlainColour(const Chunk& chunk);

} // namespace orvela
