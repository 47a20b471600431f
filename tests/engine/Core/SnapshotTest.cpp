#include "Core/Snapshot.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace orvela;

namespace {

using testplanes::Pixel;

// Red 10 x + y, green 7, blue 255 in the last column only; 5 x 3 pixels.
std::unique_ptr<CARGBPlane> picture() {
    return testplanes::make(5, 3, [](int x, int y) {
        return Pixel{static_cast<std::uint8_t>(10 * x + y), 7, static_cast<std::uint8_t>(x == 4 ? 255 : 0)};
    });
}

TEST(takeSnapshot, MeansOfBlocksFewerAtTheRightAndLowerEdge) {
    const auto plane = picture();
    plane->setColorMode(CARGBPlane::Grayscale);
    const auto half = takeSnapshot(*plane, {0, 0, 5, 3}, 2);
    ASSERT_EQ(half->width(), 3);
    ASSERT_EQ(half->height(), 2);
    EXPECT_EQ(half->colorMode(), CARGBPlane::Grayscale);
    EXPECT_EQ(testplanes::at(*half, 0, 0), (Pixel{6, 7, 0}));    // 0, 10, 1, 11: 5.5
    EXPECT_EQ(testplanes::at(*half, 2, 0), (Pixel{41, 7, 255})); // 40, 41: 40.5
    EXPECT_EQ(testplanes::at(*half, 1, 1), (Pixel{27, 7, 0}));   // 22, 32
    EXPECT_EQ(testplanes::at(*half, 2, 1), (Pixel{42, 7, 255}));
    const auto all = takeSnapshot(*plane, {0, 0, 5, 3}, 100);
    ASSERT_EQ(all->pixelCount(), 1);
    EXPECT_EQ(testplanes::at(*all, 0, 0), (Pixel{21, 7, 51})); // 20 + 1, 255 / 5
}

TEST(takeSnapshot, PartsAreCutToThePictureAndBlocksToThePart) {
    const auto plane = picture();
    const auto part = takeSnapshot(*plane, {3, 1, 9, 9}, 1);
    ASSERT_EQ(part->width(), 2);
    ASSERT_EQ(part->height(), 2);
    EXPECT_EQ(testplanes::at(*part, 0, 0), (Pixel{31, 7, 0}));
    EXPECT_EQ(testplanes::at(*part, 1, 1), (Pixel{42, 7, 255}));
    const auto blocks = takeSnapshot(*plane, {1, 1, 3, 1}, 2);
    ASSERT_EQ(blocks->width(), 2);
    ASSERT_EQ(blocks->height(), 1);
    EXPECT_EQ(testplanes::at(*blocks, 0, 0), (Pixel{16, 7, 0})); // 11, 21
    EXPECT_EQ(testplanes::at(*blocks, 1, 0), (Pixel{31, 7, 0})); // column 4 is no part of it
    EXPECT_EQ(takeSnapshot(*plane, {7, 7, 2, 2}, 1)->pixelCount(), 0);
    // 17 million samples of 255 sum up to more than 32 bits hold.
    CARGBPlane white(17'000'000, 1, QString());
    for (const Channel channel : kChannels)
        std::fill_n(white.samples(channel), white.pixelCount(), std::uint8_t{255});
    EXPECT_EQ(testplanes::at(*takeSnapshot(white, {0, 0, 17'000'000, 1}, 2'000'000'000), 0, 0),
              (Pixel{255, 255, 255}));
}

} // namespace
