#pragma once

#include "Utility/CARGBPlane.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <vector>

namespace orvela {

/// Planes for tests.
namespace testplanes {

using Pixel = std::array<std::uint8_t, 3>;

/// A plane whose pixels a function of column and row gives.
inline std::unique_ptr<CARGBPlane> make(int width, int height,
                                        const std::function<Pixel(int x, int y)>& pixel) {
    auto plane = std::make_unique<CARGBPlane>(width, height, QStringLiteral("test"));
    for (int y = 0; y < height; ++y) {
        const Row row = plane->row(y);
        for (int x = 0; x < width; ++x) {
            const Pixel p = pixel(x, y);
            for (std::size_t c = 0; c < 3; ++c)
                row[c][x] = p[c];
        }
    }
    return plane;
}

/// One colour everywhere.
inline std::unique_ptr<CARGBPlane> uniform(int width, int height, Pixel colour) {
    return make(width, height, [colour](int, int) { return colour; });
}

/// Reproducible noise over the full range.
inline std::unique_ptr<CARGBPlane> noise(int width, int height, std::uint32_t seed = 1) {
    return make(width, height, [state = seed](int, int) mutable {
        Pixel p;
        for (std::uint8_t& sample : p) {
            state = state * 1664525U + 1013904223U;
            sample = static_cast<std::uint8_t>(state >> 24);
        }
        return p;
    });
}

/// The pixel at column x, row y.
inline Pixel at(const CARGBPlane& plane, int x, int y) {
    const ConstRow row = plane.row(y);
    return {row[0][x], row[1][x], row[2][x]};
}

/// All samples, channel after channel.
inline std::vector<std::uint8_t> bytes(const CARGBPlane& plane) {
    std::vector<std::uint8_t> all;
    for (const Channel channel : kChannels)
        all.insert(all.end(), plane.samples(channel), plane.samples(channel) + plane.pixelCount());
    return all;
}

} // namespace testplanes

} // namespace orvela
