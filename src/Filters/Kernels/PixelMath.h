#pragma once

#include <algorithm>
#include <cstdint>

namespace orvela {

/// Arithmetic that several filters share.
namespace PixelMath {

/// Toward zero. The value must fit; NaN and out-of-range values are the caller's to rule out.
inline int trunc(double value) {
    return static_cast<int>(value);
}

/// Mean of the three channels, truncated: the brightness that all measurements use.
inline std::uint32_t lumaOf(std::uint32_t r, std::uint32_t g, std::uint32_t b) {
    return (r + g + b) / 3;
}

/// The three new channel values of a pixel.
struct Rgb {
    int r;
    int g;
    int b;
};

/// When a value exceeds 255, scales all three by 254 / (the largest), truncated: the largest becomes 254 and
/// the hue is kept. Exact quotients in integers: a rounded factor would leave some maxima at 253.
inline Rgb keepHue(Rgb c) {
    const int largest = std::max({c.r, c.g, c.b});
    if (largest <= 255)
        return c;
    const auto scaled = [largest](int v) { return static_cast<int>(std::int64_t{v} * 254 / largest); };
    return {scaled(c.r), scaled(c.g), scaled(c.b)};
}

/// Each channel times the ratio, truncated; rescaled with its hue.
inline Rgb scaled(Rgb c, float ratio) {
    const auto product = [ratio](int v) { return trunc(static_cast<float>(v) * ratio); };
    return keepHue({product(c.r), product(c.g), product(c.b)});
}

/// Brings a recoloured pixel to the mean brightness `mean`; a black one stays black.
inline Rgb restoreMean(Rgb c, int mean) {
    const float own = static_cast<float>(c.r + c.g + c.b) / 3;
    return own > 0 ? scaled(c, static_cast<float>(mean) / own) : c;
}

/// Step between the samples of a statistic taken over the whole picture: 5, or the longer side / 200 when
/// that side exceeds 1000 pixels and the other side.
inline int samplingStep(int width, int height) {
    if (height > 1000 && height > width)
        return height / 200;
    if (width > 1000 && width > height)
        return width / 200;
    return 5;
}

} // namespace PixelMath

} // namespace orvela
