#pragma once

#include "files/FileFormat.h"

namespace orvela {

/// Number of pictures of an animated PNG that are shown one after the other; 1 for a still one.
int pngFrames(ByteView file);

/// Number of pictures in an animated WebP; 1 for a still one.
int webpFrames(ByteView file);

/// Pictures of a HEIF.
struct HeifPictures {
    int frames = 0;     ///< of its image sequence; 0 without one
    bool still = false; ///< it holds pictures beside the sequence
};
HeifPictures heifPictures(ByteView file);

} // namespace orvela
