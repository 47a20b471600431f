#include "GUI/Panes/TrackZones.h"

#include <QMap>
#include <QStringList>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

const QMap<QString, QColor> kColors = {{"green", QColor(0, 255, 40)},  {"orange", QColor(255, 120, 0)},
                                       {"pale", QColor(255, 170, 23)}, {"red", QColor(255, 40, 0)},
                                       {"blue", QColor(0, 0, 255)},    {"light blue", QColor(0, 40, 255)}};

// The bands of the sets from 1 on: first and last position, colour.
const QStringList kSets = {
    "0-599 green, 600-899 orange, 900-1000 red",
    "0-199 red, 200-399 orange, 400-887 green, 888-943 orange, 944-1000 red",
    "0-1000 light blue",
    "0-1000 blue",
    "0-199 red, 200-399 orange, 400-687 green, 688-943 orange, 944-1000 red",
    "0-694 green, 695-864 orange, 865-1000 red",
    "0-749 green, 750-1000 orange",
    "0-699 green, 700-1000 orange",
    "0-299 green, 300-499 orange, 500-1000 red",
    "0-349 red, 350-499 orange, 500-1000 green",
    "0-1000 blue",
    "0-199 red, 200-399 orange, 400-587 green, 588-643 orange, 644-1000 red",
    "0-199 red, 200-399 pale, 400-687 green, 688-943 pale, 944-1000 red",
};

TEST(TrackZones, EveryBandHasItsColourFromItsFirstPositionToItsLast) {
    for (int number = 1; number <= kSets.size(); ++number) {
        const QList<ZoneStop> stops = TrackZones::set(static_cast<ZoneSet>(number));
        const QStringList bands = kSets[number - 1].split(", ");
        EXPECT_EQ(stops.size(), 2 * bands.size()) << number;
        for (const QString& band : bands) {
            const QString ends = band.section(' ', 0, 0);
            for (const QString& position : ends.split('-'))
                EXPECT_EQ(zoneColor(stops, position.toDouble()), kColors[band.section(' ', 1)])
                    << number << " at " << qPrintable(position);
        }
    }
    EXPECT_TRUE(TrackZones::set(static_cast<ZoneSet>(0)).isEmpty());
    EXPECT_TRUE(TrackZones::set(static_cast<ZoneSet>(kSets.size() + 1)).isEmpty());
}

} // namespace
