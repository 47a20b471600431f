#pragma once

#include "Filters/Kernels/PixelRow.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace orvela {

/// A curve of a channel value that also depends on its pixel's R + G + B, worked out for every pair that a
/// pixel can have. 196 KB.
class SumValueTable {
public:
    static constexpr int kSums = 3 * 255 + 1; ///< different sums of a pixel

    /// Fills the table.
    /// @param curveOf  R + G + B (0 to 765) to a curve, which takes a channel value (0 to 255) to another
    template <typename CurveOf>
    void build(CurveOf curveOf) {
        mValues.assign(kSums * 256, 0);
        for (int sum = 0; sum < kSums; ++sum) {
            const auto curve = curveOf(sum);
            std::uint8_t* values = mValues.data() + sum * 256;
            // The other two channels add up to 510 at most.
            for (int c = std::max(0, sum - 510); c <= std::min(255, sum); ++c)
                values[c] = static_cast<std::uint8_t>(curve(c));
        }
    }

    /// Maps the three channels of a row.
    void map(const PixelRow& row) const { map({this, this, this}, row); }

    /// Maps the channels of a row, each by its own table.
    static void map(const std::array<const SumValueTable*, 3>& tables, const PixelRow& row) {
        const std::uint8_t* const red = tables[0]->mValues.data();
        const std::uint8_t* const green = tables[1]->mValues.data();
        const std::uint8_t* const blue = tables[2]->mValues.data();
        for (int x = 0; x < row.width; ++x) {
            const int r = row.in[0][x];
            const int g = row.in[1][x];
            const int b = row.in[2][x];
            const int line = (r + g + b) * 256;
            row.out[0][x] = red[line + r];
            row.out[1][x] = green[line + g];
            row.out[2][x] = blue[line + b];
        }
    }

private:
    std::vector<std::uint8_t> mValues;
};

} // namespace orvela
