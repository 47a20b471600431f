#pragma once

#include "Filters/ChannelTable.h"

#include <cmath>

/// The power curve of the gamma filters.
namespace GammaCurve {

/// trunc((float)pow(c / 255, 1 / gamma) * 255), 0 for a channel value of 0 or a gamma that is not positive.
/// A gamma above 1 brightens, below 1 darkens; 1 is the identity.
/// @param c  channel value, 0 to 255
inline int apply(int c, float gamma) {
    if (c <= 0 || !(gamma > 0))
        return 0;
    const auto power = static_cast<float>(std::pow(c / 255.0, 1 / static_cast<double>(gamma)));
    return PixelMath::trunc(power * 255.0F);
}

inline ChannelTable table(float gamma) {
    return makeChannelTable([gamma](int c) { return apply(c, gamma); });
}

} // namespace GammaCurve
