#pragma once

#include "files/Photograph.h"

namespace orvela {

/// A photograph that comes from no file; byte i of its samples is `byteAt(i)`, cut to eight bits.
template <typename ByteAt>
Photograph testPhotograph(ColorModel model, int depth, int width, int height, ByteAt byteAt) {
    Photograph photograph;
    photograph.width = width;
    photograph.height = height;
    photograph.depth = depth;
    photograph.model = model;
    photograph.samples.resize(static_cast<std::size_t>(width * height * samplesPerPixel(model) * depth / 8));
    for (std::size_t i = 0; i < photograph.samples.size(); ++i)
        photograph.samples[i] = static_cast<std::uint8_t>(byteAt(i));
    return photograph;
}

} // namespace orvela
