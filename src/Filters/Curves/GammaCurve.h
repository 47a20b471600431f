#pragma once

#include "Filters/Kernels/RowMapping.h"

#include <cmath>

namespace orvela {

/// The power curve of the gamma and midtone filters. A gamma above 1 brightens, below 1 darkens; 1 is the
/// identity.
namespace GammaCurve {

/// (float)pow(c / 255, 1 / gamma) * 255; 0 for a channel value below 1 or a gamma that is not positive.
/// @param c  channel value, 0 to 255
inline float transfer(int c, float gamma) {
    if (c < 1 || !(gamma > 0))
        return 0;
    return static_cast<float>(std::pow(c / 255.0, 1 / static_cast<double>(gamma))) * 255.0F;
}

/// The same, truncated.
inline int apply(int c, float gamma) {
    return PixelMath::trunc(transfer(c, gamma));
}

inline ChannelTable table(float gamma) {
    return makeTable([gamma](int c) { return apply(c, gamma); });
}

} // namespace GammaCurve

} // namespace orvela
