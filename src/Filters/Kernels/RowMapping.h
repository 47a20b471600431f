#pragma once

#include "Filters/Kernels/PixelMath.h"
#include "Filters/Kernels/PixelRow.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>

namespace orvela {

// How filters map the samples of a row: by a function of the pixel, or by curves of one channel value that
// are worked out for all 256 values beforehand.

/// What a curve makes of each channel value.
using ChannelTable = std::array<std::uint8_t, 256>;

/// The same before the hue-keeping rescale: at least 0, may exceed 255.
using WideTable = std::array<int, 256>;

/// For red, green and blue.
using WideTables = std::array<WideTable, 3>;

/// @tparam Table  ChannelTable or WideTable
/// @param curve   channel value (0 to 255) to the table's value
template <typename Table = ChannelTable, typename Curve>
Table makeTable(Curve curve) {
    Table table;
    for (std::size_t c = 0; c < table.size(); ++c)
        table[c] = static_cast<typename Table::value_type>(curve(static_cast<int>(c)));
    return table;
}

/// Copies the row.
inline void copyPixels(const PixelRow& row) {
    for (std::size_t c = 0; c < 3; ++c)
        std::copy_n(row.in[c], row.width, row.out[c]);
}

/// Maps the channels of a row, each by its own table.
inline void mapChannels(const std::array<const ChannelTable*, 3>& tables, const PixelRow& row) {
    for (std::size_t c = 0; c < 3; ++c) {
        const auto lookUp = [&table = *tables[c]](std::uint8_t value) { return table[value]; };
        std::transform(row.in[c], row.in[c] + row.width, row.out[c], lookUp);
    }
}

/// Maps the three channels of a row by one table.
inline void mapChannels(const ChannelTable& table, const PixelRow& row) {
    mapChannels({&table, &table, &table}, row);
}

/// Maps the pixels of a row.
/// @param map  red, green and blue to PixelMath::Rgb, whose values fit into samples
template <typename Map>
void mapPixels(const PixelRow& row, Map map) {
    for (int x = 0; x < row.width; ++x) {
        const PixelMath::Rgb c = map(row.in[0][x], row.in[1][x], row.in[2][x]);
        row.out[0][x] = static_cast<std::uint8_t>(c.r);
        row.out[1][x] = static_cast<std::uint8_t>(c.g);
        row.out[2][x] = static_cast<std::uint8_t>(c.b);
    }
}

/// Maps the channels of a row, each by its own table; a pixel that exceeds 255 is scaled down as a whole
/// (PixelMath::keepHue).
inline void mapKeepingHue(const WideTables& tables, const PixelRow& row) {
    mapPixels(row, [&](std::uint8_t r, std::uint8_t g, std::uint8_t b) {
        return PixelMath::keepHue({tables[0][r], tables[1][g], tables[2][b]});
    });
}

} // namespace orvela
