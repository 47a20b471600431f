#include "Filters/Kernels/ScaledTile.h"

#include "Filters/Kernels/PixelMath.h"
#include "Filters/Kernels/Simd.h"

#include <algorithm>

namespace orvela {

namespace {

constexpr float kLargestProduct = 1e9; // keeps extreme ratios within integers

struct Products {
    int channel[3][ScaledTile::kWidth];
};

// How many pixels leave the range.
ORVELA_SIMD int multiply(const ScaledTile& tile, Products& products, int count) {
    for (int c = 0; c < 3; ++c) {
        for (int i = 0; i < count; ++i) {
            const float product = tile.channel[c][i] * tile.ratio[i];
            products.channel[c][i] = static_cast<int>(product < kLargestProduct ? product : kLargestProduct);
        }
    }
    int over = 0;
    for (int i = 0; i < count; ++i) {
        // Products above 255 have bits that those in range have not.
        const int bits = products.channel[0][i] | products.channel[1][i] | products.channel[2][i];
        over += bits > 255 ? 1 : 0;
    }
    return over;
}

ORVELA_SIMD void write(const int* values, std::uint8_t* out, int count) {
    for (int i = 0; i < count; ++i)
        out[i] = static_cast<std::uint8_t>(values[i]);
}

} // namespace

void ScaledTile::store(const Row& out, int first, int count) const {
    Products products;
    auto& [r, g, b] = products.channel;
    int over = multiply(*this, products, count);
    for (int i = 0; over > 0; ++i) {
        if ((r[i] | g[i] | b[i]) <= 255)
            continue;
        const PixelMath::Rgb kept = PixelMath::keepHue({r[i], g[i], b[i]});
        r[i] = kept.r;
        g[i] = kept.g;
        b[i] = kept.b;
        --over;
    }
    for (std::size_t c = 0; c < 3; ++c)
        write(products.channel[c], out[c] + first, count);
}

} // namespace orvela
