#pragma once

#include "metadata/Bytes.h"

namespace orvela {

/// A chunk of a PNG; refers to the file.
struct PngChunk {
    std::string_view name;
    ByteView data;
    ByteView whole; ///< with its head and its checksum
};

/// The chunks up to the one that ends the picture, as far as they are whole.
std::vector<PngChunk> pngChunks(ByteView file);

/// What stands behind the end of the picture; nothing where that is missing.
ByteView behindPng(ByteView file);

/// Whether there is a whole chunk of that name.
bool hasPngChunk(ByteView file, std::string_view name);

/// How many pictures the file shows one after the other: 1 unless it is an animation.
int pngFrames(ByteView file);

/// The first bytes of a file without chunks.
Bytes emptyPng();

/// Appends a chunk with its checksum.
void putPngChunk(Bytes& file, std::string_view name, ByteView data);

} // namespace orvela
