#include "Filters/BilateralKernel.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>

namespace {

using testplanes::bytes;
using testplanes::Pixel;

// Soft waves with edges and a little noise, as in a photograph.
std::unique_ptr<CARGBPlane> waves(int width, int height) {
    const auto grain = testplanes::noise(width, height, 3);
    return testplanes::make(width, height, [&grain](int x, int y) {
        Pixel pixel = testplanes::at(*grain, x, y);
        for (std::uint8_t& sample : pixel) {
            const double light =
                128 + 70 * std::sin(x * 0.07) * std::cos(y * 0.31) + (x % 40 < 20 ? 40 : -40);
            sample = static_cast<std::uint8_t>(light + sample / 16);
        }
        return pixel;
    });
}

std::vector<float> decay(std::size_t count, double variance) {
    std::vector<float> table(count);
    for (std::size_t i = 0; i < count; ++i)
        table[i] = static_cast<float>(std::exp(-static_cast<double>(i) / variance));
    return table;
}

TEST(BilateralKernel, TilesAndPlainFormGiveTheSameBytes) {
    const std::vector<float> range = decay(195076, 1125);
    for (const auto& [width, height] : {std::pair{2, 3}, {3, 3}, {258, 9}, {259, 9}, {777, 40}}) {
        const std::unique_ptr<CARGBPlane> pictures[] = {testplanes::noise(width, height),
                                                        waves(width, height),
                                                        testplanes::uniform(width, height, {0, 0, 0}),
                                                        testplanes::uniform(width, height, {255, 255, 255}),
                                                        testplanes::uniform(width, height, {255, 0, 9})};
        for (const auto& in : pictures) {
            for (const double variance : {0.25, 4.0, 25.0}) {
                const std::vector<float> spatial = decay(3, variance);
                const BilateralKernel kernel(spatial.data(), range.data());
                CARGBPlane tiled(*in, QStringLiteral("tiled"));
                CARGBPlane plain(*in, QStringLiteral("plain"));
                for (int y = 1; y < height - 1; ++y) {
                    kernel.applyRow(*in, tiled, y);
                    kernel.applyRowPlain(*in, plain, y);
                }
                EXPECT_TRUE(bytes(tiled) == bytes(plain)) << width << " variance " << variance;
            }
        }
    }
}

} // namespace
