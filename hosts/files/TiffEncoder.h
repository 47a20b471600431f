#pragma once

#include "files/TargetFile.h"
#include "files/TiffStorage.h"

namespace orvela {

/// Appends the samples of a picture to a file, as strips or tiles.
/// @return the fields that tell how they are stored, in the byte order given; offsets as numbers of eight
/// bytes
/// @throws TargetError, StoppedError; TiffError when libtiff cannot encode them
std::vector<TiffField> encodeTiffBlocks(TargetFile& file, const Photograph& photograph,
                                        const TiffStorage& storage, ByteOrder order,
                                        const std::atomic<bool>* stop);

} // namespace orvela
