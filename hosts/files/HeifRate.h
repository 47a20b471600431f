#pragma once

#include "files/Photograph.h"

#include <functional>

namespace orvela {

struct HeifRate {
    Photograph sample;        ///< parts of the picture, put together
    double bytesPerPixel = 0; ///< of the whole picture in its file
};

/// Coding blocks from all over the picture, put together to 768 pixels both ways; a smaller picture is taken
/// whole.
Photograph heifSample(const Photograph& photograph);

/// The lowest and highest quality that is chosen without being asked for.
inline constexpr int kLowestHeifQuality = 25;
inline constexpr int kHighestHeifQuality = 95;

/// The quality at which a picture takes about as many bytes per pixel as given.
/// @param encode  bytes per pixel that the sample takes at a quality; rises with it; called five times at the
/// most
int matchingQuality(double bytesPerPixel, const std::function<double(int)>& encode);

} // namespace orvela
