#pragma once

#include "Filters/PixelMath.h"
#include "Utility/CARGBPlane.h"

#include <array>
#include <cstddef>
#include <cstdint>

/// A curve of one channel value, worked out for all 256 of them.
using ChannelTable = std::array<std::uint8_t, 256>;

/// @param curve  channel value (0 to 255) to channel value
template <typename Curve>
ChannelTable makeChannelTable(Curve curve) {
    ChannelTable table;
    for (std::size_t c = 0; c < table.size(); ++c)
        table[c] = static_cast<std::uint8_t>(curve(static_cast<int>(c)));
    return table;
}

/// Maps the three channels of a row.
inline void mapRow(const ChannelTable& table, ConstRow in, Row out, int width) {
    for (std::size_t channel = 0; channel < in.size(); ++channel) {
        const std::uint8_t* from = in[channel];
        std::uint8_t* to = out[channel];
        for (int x = 0; x < width; ++x)
            to[x] = table[from[x]];
    }
}
