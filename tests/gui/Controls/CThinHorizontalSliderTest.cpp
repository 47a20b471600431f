#include "GUI/Controls/CThinHorizontalSlider.h"

#include "Painted.h"
#include "support/LogCapture.h"

#include <gtest/gtest.h>

#include <cmath>

using namespace orvela;

namespace {

const QColor kGreen(0, 255, 40);
const QColor kOrange(255, 120, 0);

TEST(CThinHorizontalSlider, FillsUpToTheValueInTheColorOfItsZone) {
    CThinHorizontalSlider slider;
    slider.resize(101, 7);
    slider.setZoneStops({{0, kGreen}, {599, kGreen}, {600, kOrange}, {1000, kOrange}});
    slider.setValue(500);
    EXPECT_EQ(painted(slider).pixelColor(30, 3), kGreen);
    EXPECT_NE(painted(slider).pixelColor(70, 3), kGreen) << "beyond the value";
    for (double value : {800.0, 5000.0, double(INFINITY)}) {
        slider.setValue(value);
        EXPECT_EQ(painted(slider).pixelColor(70, 3), kOrange);
    }
}

TEST(CThinHorizontalSlider, WarnsOnceAndGoesGreyWithoutZones) {
    const LogCapture log;
    CThinHorizontalSlider slider;
    slider.resize(101, 7);
    slider.setZoneStops({{0, kGreen}});
    slider.setValue(500);
    EXPECT_EQ(painted(slider).pixelColor(30, 3), QColor(122, 122, 122));
    painted(slider);
    EXPECT_EQ(log.lines().size(), 1u);
    EXPECT_TRUE(log.has("This slider is using loadDefaultColors, this is probably a programming error."));
    EXPECT_EQ(slider.zoneStops(), (QList<ZoneStop>{{0, QColor(0, 0, 0)}, {1000, QColor(244, 244, 244)}}));
}

} // namespace
