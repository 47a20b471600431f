#pragma once

#include "metadata/Bytes.h"

namespace orvela {

/// Quality of a JPEG, 1 to 100: the one whose scaled standard luminance table is nearest to the file's, exact
/// for files that were written with scaled standard tables. 0 when the file has no table.
int jpegQuality(ByteView file);

} // namespace orvela
