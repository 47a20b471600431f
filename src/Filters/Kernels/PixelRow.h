#pragma once

#include "Utility/CARGBPlane.h"

namespace orvela {

/// One row of a picture on its way through a filter whose result for a pixel depends on that pixel alone. The
/// rows that are read and written may be the same.
struct PixelRow {
    int y;     ///< its place in the picture
    int width; ///< in pixels
    ConstRow in;
    Row out;
};

} // namespace orvela
