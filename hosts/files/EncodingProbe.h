#pragma once

#include "files/FileFormat.h"

// What the bytes of a file tell about its encoding beyond what the decoder reports.

namespace orvela {

/// Quality, chroma sampling and progression of a JPEG. The quality is the one whose scaled standard luminance
/// table is nearest to the file's: exact for files that were written with scaled standard tables.
Encoding probeJpeg(ByteView file);

/// Whether the JPEG goes on to its end marker.
bool jpegIsComplete(ByteView file);

/// Whether the PNG goes on to the end of its last chunk.
bool pngIsComplete(ByteView file);

/// Whether the (first) picture of a WebP is encoded without loss.
bool webpIsLossless(ByteView file);

} // namespace orvela
