#pragma once

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

namespace orvela {

/// What the tests share that hold the fast form of a kernel against its plain one.
namespace kernelforms {

inline std::uint8_t level(double value) {
    return static_cast<std::uint8_t>(std::clamp(value, 0.0, 255.0));
}

/// Soft waves with edges and a little noise, as in a photograph.
inline std::unique_ptr<CARGBPlane> waves(int width, int height) {
    const auto grain = testplanes::noise(width, height, 3);
    return testplanes::make(width, height, [&grain](int x, int y) {
        testplanes::Pixel pixel = testplanes::at(*grain, x, y);
        const double light = 120 + 80 * std::sin(x * 0.07) * std::cos(y * 0.31) + (x % 40 < 20 ? 35 : -35);
        for (std::uint8_t& sample : pixel)
            sample = level(light + sample / 16);
        return pixel;
    });
}

/// Expects both forms, called with a picture to change and a row, to give the same; whether that is another
/// picture.
/// @param border  rows above and below that they leave
template <typename Fast, typename Plain>
bool change(const CARGBPlane& in, const Fast& fast, const Plain& plain, int border = 0) {
    CARGBPlane tiled(in, QStringLiteral("tiled"));
    CARGBPlane single(in, QStringLiteral("plain"));
    for (int y = border; y < in.height() - border; ++y) {
        fast(tiled, y);
        plain(single, y);
    }
    EXPECT_TRUE(testplanes::bytes(tiled) == testplanes::bytes(single)) << in.width() << 'x' << in.height();
    return testplanes::bytes(tiled) != testplanes::bytes(in);
}

} // namespace kernelforms

} // namespace orvela
