#pragma once

#include "metadata/Bytes.h"

namespace orvela {

/// Whether the pictures of a HEVC configuration ("hvcC") may be coded without loss, by their picture
/// parameter sets. The flag only allows it, block by block; a picture of which some blocks are lossy counts
/// as well. False where that cannot be read.
bool isLosslessHevc(ByteView configuration);

} // namespace orvela
