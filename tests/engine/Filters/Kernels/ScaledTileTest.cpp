#include "Filters/Kernels/ScaledTile.h"

#include "Filters/Kernels/PixelMath.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

// Ratios up to 3 and huge ones over noise, white and a single channel.
TEST(ScaledTile, GivesTheBytesOfThePixelwiseForm) {
    for (const int count : {1, 7, 31, 255, 256}) {
        for (const auto& in : {testplanes::noise(count, 1), testplanes::uniform(count, 1, {255, 255, 255}),
                               testplanes::uniform(count, 1, {0, 255, 1})}) {
            for (const float largest : {0.999F, 3.0F, 3e6F}) {
                ScaledTile tile;
                CARGBPlane out(count + 1, 1, QStringLiteral("out"));
                for (int i = 0; i < count; ++i) {
                    const testplanes::Pixel p = testplanes::at(*in, i, 0);
                    tile.set(i, {p[0], p[1], p[2]}, largest * static_cast<float>(i % 64) / 63);
                }
                tile.store(out.row(0), 1, count);
                for (int i = 0; i < count; ++i) {
                    const testplanes::Pixel p = testplanes::at(*in, i, 0);
                    const PixelMath::Rgb expected = PixelMath::scaled({p[0], p[1], p[2]}, tile.ratio[i]);
                    const testplanes::Pixel got = testplanes::at(out, i + 1, 0);
                    ASSERT_EQ((std::array<int, 3>{got[0], got[1], got[2]}),
                              (std::array{expected.r, expected.g, expected.b}))
                        << i << " times " << tile.ratio[i];
                }
            }
        }
    }
}

TEST(ScaledTile, RatiosBeyondIntegersKeepGreysGrey) {
    ScaledTile tile;
    tile.set(0, {9, 9, 9}, 1e30F);
    CARGBPlane out(1, 1, QStringLiteral("out"));
    tile.store(out.row(0), 0, 1);
    EXPECT_EQ(testplanes::at(out, 0, 0), (testplanes::Pixel{254, 254, 254}));
}

} // namespace
