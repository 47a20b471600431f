#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the image resources of a PSD say.
Metadata readPsdMetadata(ByteView file);

struct PsdLayers {
    int count = 0;             ///< 0 also for a single one, which is the merged picture itself
    bool transparency = false; ///< the first channel beside the colours is the merged picture's transparency
};

/// Reads them from the file's section of layers, as far as it is whole.
PsdLayers psdLayers(ByteView section);

} // namespace orvela
