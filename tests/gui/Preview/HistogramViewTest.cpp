#include "GUI/Preview/HistogramView.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <numeric>

using namespace orvela;

namespace {

double total(const LevelCounts::Counts& counts) {
    return std::accumulate(counts.begin(), counts.end(), 0.0);
}

TEST(LevelCounts, OfASmallPictureAreThoseCountedByHand) {
    // Luma: (299 * 255 + 500) / 1000 = 76, (587 * 255 + 500) / 1000 = 150, (114 * 255 + 500) / 1000 = 29.
    const testplanes::Pixel colours[] = {{255, 0, 0}, {0, 255, 0}, {0, 0, 255}, {7, 7, 7}, {7, 7, 7}};
    const auto picture = testplanes::make(5, 1, [&](int x, int) { return colours[x]; });
    const LevelCounts counts = LevelCounts::of(*picture);
    for (const LevelCounts::Counts& channel : counts.channels) {
        EXPECT_EQ(channel[0], 2);
        EXPECT_EQ(channel[7], 2);
        EXPECT_EQ(channel[255], 1);
        EXPECT_EQ(total(channel), 5);
    }
    EXPECT_EQ(counts.luma[76], 1);
    EXPECT_EQ(counts.luma[150], 1);
    EXPECT_EQ(counts.luma[29], 1);
    EXPECT_EQ(counts.luma[7], 2);
    EXPECT_EQ(total(counts.luma), 5);
}

TEST(LevelCounts, OfAGreyPictureAreTheSameInEveryChannel) {
    const auto picture = testplanes::make(3, 2, [](int x, int) {
        return testplanes::Pixel{std::uint8_t(x), 200, 99};
    });
    picture->setColorMode(CARGBPlane::Grayscale); // only the first plane is the picture
    const LevelCounts counts = LevelCounts::of(*picture);
    for (const auto& each : {counts.luma, counts.channels[0], counts.channels[1], counts.channels[2]})
        for (int level = 0; level < 3; ++level)
            EXPECT_EQ(each[static_cast<std::size_t>(level)], 2);
}

// A column of dark pixels among bright ones is a column's share of the counts, wherever the samples fall.
TEST(LevelCounts, OfALargePictureAreASampleOfEveryColumn) {
    const auto picture = testplanes::make(2000, 1000, [](int x, int) {
        return x % 2 == 0 ? testplanes::Pixel{10, 10, 10} : testplanes::Pixel{200, 200, 200};
    });
    const LevelCounts counts = LevelCounts::of(*picture);
    EXPECT_NEAR(counts.luma[10] / total(counts.luma), 0.5, 0.02);
}

TEST(HistogramView, IsHighestWhereMostPixelsAreAndClippedOnesDoNotFlattenIt) {
    HistogramView view;
    view.resize(256, 72);
    const auto picture = testplanes::make(100, 100, [](int, int y) {
        const std::uint8_t level = y < 80 ? 255 : y < 95 ? 100 : 180; // a sky that is clipped
        return testplanes::Pixel{level, level, level};
    });
    view.setCounts(LevelCounts::of(*picture));
    const QImage image = view.grab().toImage().scaled(256, 72);
    const auto heightAt = [&image](int x) {
        int height = 0;
        while (height < 72 && qGray(image.pixel(x, 71 - height)) > 60)
            ++height;
        return height;
    };
    EXPECT_GT(heightAt(100), 65);
    EXPECT_NEAR(heightAt(180), heightAt(100) / 3.0, 5);
    EXPECT_LT(heightAt(140), 3);
}

} // namespace
