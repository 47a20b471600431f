#pragma once

#include "metadata/Bytes.h"

namespace orvela {

/// Whether the pictures of a HEVC configuration ("hvcC") may be coded without loss, by their picture
/// parameter sets: encoders set the flag for nothing else. False where that cannot be read.
bool isLosslessHevc(ByteView configuration);

} // namespace orvela
