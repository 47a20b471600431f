#pragma once

#include "metadata/Metadata.h"

namespace orvela {

/// What the image resources of a PSD say.
Metadata readPsdMetadata(ByteView file);

} // namespace orvela
