#pragma once

#include "files/Photograph.h"

namespace orvela {

/// How the samples of a picture lie in memory: interleaved, rows from the top without padding.
struct PictureShape {
    int width = 0;
    int height = 0;
    int depth = 8; ///< bits per sample, 8 or 16 (native, 0 to 65535)
    ColorModel model = ColorModel::Rgb;
    double xResolution = 0; ///< pixels per millimetre; 0 when unknown
    double yResolution = 0; ///< pixels per millimetre; 0 when unknown

    std::size_t bytesPerRow() const {
        return static_cast<std::size_t>(width) * static_cast<std::size_t>(samplesPerPixel(model) * depth / 8);
    }
    std::size_t bytes() const { return bytesPerRow() * static_cast<std::size_t>(height); }
};

inline PictureShape shapeOf(const Photograph& photograph) {
    return {photograph.width, photograph.height,      photograph.depth,
            photograph.model, photograph.xResolution, photograph.yResolution};
}

} // namespace orvela
