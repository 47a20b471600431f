#pragma once

#include "files/FileFormat.h"

namespace orvela {

/// What must become of a picture so that a file of some format can hold it.
struct Conversion {
    bool flattens = false;     ///< transparency is laid over white
    bool dropsExtra = false;   ///< the channel that is no transparency goes
    bool colours = false;      ///< grey becomes RGB
    bool dropsProfile = false; ///< since it describes grey
    int bits = 0;              ///< that a sample keeps of its 16; 0 all that it has
};

/// What a format that formatObstacle lets pass asks for.
Conversion conversionFor(FileFormat format, const Photograph& photograph);

/// What the picture loses by it, for messages.
std::vector<std::string> losses(const Conversion& conversion);

/// Whether the samples change.
bool changesSamples(const Conversion& conversion);

/// The photograph after it.
Photograph converted(const Photograph& photograph, const Conversion& conversion);

/// Bits per sample of a deep picture in a HEIF: those of a HEIF source, otherwise 10.
int heifBitDepth(const Photograph& photograph);

} // namespace orvela
