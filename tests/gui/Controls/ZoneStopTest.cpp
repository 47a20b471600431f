#include "GUI/Controls/ZoneStop.h"

#include <gtest/gtest.h>

using namespace orvela;

TEST(ZoneStop, KeepsBandsAndMixesBetweenTheirEdges) {
    const QColor green(0, 255, 40);
    const QColor orange(255, 120, 0);
    const QList<ZoneStop> stops = {{100, green}, {599, green}, {600, orange}, {1000, QColor(0, 0, 0)}};
    EXPECT_EQ(zoneColor(stops, 0), green);
    EXPECT_EQ(zoneColor(stops, 599), green);
    EXPECT_EQ(zoneColor(stops, 599.5), QColor(128, 188, 20)); // halves round up
    EXPECT_EQ(zoneColor(stops, 600), orange);
    EXPECT_EQ(zoneColor(stops, 700), QColor(191, 90, 0));
    EXPECT_EQ(zoneColor(stops, 50000), QColor(0, 0, 0));
}
