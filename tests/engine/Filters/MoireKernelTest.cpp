#include "Filters/MoireKernel.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>

namespace {

using testplanes::bytes;
using testplanes::Pixel;
using Picture = std::unique_ptr<CARGBPlane>;

std::uint8_t level(double value) {
    return static_cast<std::uint8_t>(std::clamp(value, 0.0, 255.0));
}

// Waves with edges, as in a photograph.
Picture waves(int width, int height) {
    return testplanes::make(width, height, [](int x, int y) {
        const double light = 128 + 90 * std::sin(x * 0.07) * std::cos(y * 0.31) + (x % 40 < 20 ? 25 : -25);
        return Pixel{level(light), level(light * 0.8 + 20), level(light * 1.2)};
    });
}

// Each channel moved by 13 to 19 levels either way: about the limit.
Picture moved(const CARGBPlane& from) {
    return testplanes::make(from.width(), from.height(), [&from](int x, int y) {
        Pixel pixel = testplanes::at(from, x, y);
        for (std::uint8_t& sample : pixel)
            sample = level(sample + (13 + (x + 3 * y) % 7) * (x % 5 < 3 ? 1 : -1));
        return pixel;
    });
}

TEST(MoireKernel, TilesAndPlainFormGiveTheSameBytes) {
    for (const auto& [width, height] :
         {std::pair{1, 1}, {4, 9}, {5, 6}, {6, 5}, {7, 7}, {261, 12}, {530, 9}}) {
        const Picture pictures[] = {testplanes::noise(width, height), waves(width, height),
                                    testplanes::uniform(width, height, {100, 100, 100}),
                                    testplanes::uniform(width, height, {0, 0, 0}),
                                    testplanes::uniform(width, height, {255, 255, 255})};
        for (const Picture& in : pictures) {
            for (const Picture& host : {moved(*in), testplanes::noise(width, height, 5)}) {
                for (const float position : {0.0F, 333.0F, 1000.0F}) {
                    const MoireKernel kernel(position);
                    CARGBPlane tiled(width, height, QStringLiteral("tiled"));
                    CARGBPlane plain(width, height, QStringLiteral("plain"));
                    for (int y = 0; y < height; ++y) {
                        kernel.applyRow(*in, std::as_const(*host).row(y), tiled, y);
                        kernel.applyRowPlain(*in, std::as_const(*host).row(y), plain, y);
                    }
                    ASSERT_EQ(bytes(tiled), bytes(plain)) << width << 'x' << height << " at " << position;
                    if (width > 7) {
                        EXPECT_TRUE(bytes(plain) != bytes(*in) && bytes(plain) != bytes(*host));
                    }
                }
            }
        }
    }
}

} // namespace
