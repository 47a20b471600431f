#pragma once

#include "Filters/Kernels/PixelMath.h"
#include "Utility/CARGBPlane.h"

#include <algorithm>

namespace orvela {

/// A run of recoloured pixels on their way into a row, each with the ratio that restores its brightness.
struct ScaledTile {
    static constexpr int kWidth = 256;

    float channel[3][kWidth]; ///< at least 0
    float ratio[kWidth];      ///< at least 0

    void set(int i, PixelMath::Rgb c, float factor) {
        channel[0][i] = static_cast<float>(c.r);
        channel[1][i] = static_cast<float>(c.g);
        channel[2][i] = static_cast<float>(c.b);
        ratio[i] = factor;
    }

    /// Writes the first `count` pixels from column `first` on: each channel times the ratio, truncated, in
    /// pixels above 255 rescaled with the hue kept (PixelMath::keepHue).
    void store(const Row& out, int first, int count) const;
};

/// Recolours the columns first to last - 1 of a row.
/// @param fill  called as fill(tile, i, x) to set pixel i of the tile, which is column x of the row
template <typename Fill>
void recolourRow(const Row& out, int first, int last, Fill fill) {
    ScaledTile tile;
    for (int start = first; start < last; start += ScaledTile::kWidth) {
        const int count = std::min(ScaledTile::kWidth, last - start);
        for (int i = 0; i < count; ++i)
            fill(tile, i, start + i);
        tile.store(out, start, count);
    }
}

} // namespace orvela
