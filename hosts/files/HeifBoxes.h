#pragma once

#include "files/FileFormat.h"
#include "files/PixelBounds.h"

namespace orvela {

/// How the primary picture of a HEIF is coded, its tiles together.
struct HeifCoding {
    bool isAv1 = false;
    bool lossless = false;                    ///< known of HEVC only
    Chroma chroma = Chroma::Half;             ///< of a grey picture Half too
    std::uint64_t bytes = 0;                  ///< that it takes, without metadata and other pictures
    double mostPixelsPerByte = bounds::kNone; ///< of the file
    std::vector<std::string> otherProperties; ///< of the primary picture, by their four letters: "clli"
};

/// Reads it from the boxes of the file; none where they do not tell.
std::optional<HeifCoding> heifCoding(ByteView file);

/// Pictures of a HEIF, as far as its boxes can be followed.
struct HeifPictures {
    int frames = 0;     ///< of its image sequence; 0 without one
    bool still = false; ///< it holds pictures beside the sequence
};
HeifPictures heifPictures(ByteView file);

} // namespace orvela
