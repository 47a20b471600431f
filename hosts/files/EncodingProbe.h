#pragma once

#include "files/FileFormat.h"

// What the bytes of a file tell about its encoding beyond what the decoder reports.

namespace orvela {

/// Whether the PNG goes on to the end of its last chunk.
bool pngIsComplete(ByteView file);

/// Whether the (first) picture of a WebP is encoded without loss.
bool webpIsLossless(ByteView file);

} // namespace orvela
