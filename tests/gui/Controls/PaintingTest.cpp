#include "GUI/Controls/COrvelaStatusIndicator.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Windows/MessageBoxes.h"
#include "Utility/DebugBoxes.h"
#include "support/LogCapture.h"

#include <QAbstractButton>
#include <QAccessible>
#include <QApplication>
#include <QMessageBox>
#include <QTimer>

#include <gtest/gtest.h>

#include <cmath>

using namespace orvela;

namespace {

const QColor kGreen(0, 255, 40);
const QColor kOrange(255, 120, 0);

QImage painted(QWidget& widget) {
    QImage image(widget.size(), QImage::Format_RGB32);
    widget.render(&image);
    return image;
}

TEST(ZoneColor, KeepsBandsAndMixesBetweenTheirEdges) {
    const QList<ZoneStop> stops = {{100, kGreen}, {599, kGreen}, {600, kOrange}, {1000, QColor(0, 0, 0)}};
    EXPECT_EQ(zoneColor(stops, 0), kGreen);
    EXPECT_EQ(zoneColor(stops, 599), kGreen);
    EXPECT_EQ(zoneColor(stops, 599.5), QColor(128, 188, 20)); // halves round up
    EXPECT_EQ(zoneColor(stops, 600), kOrange);
    EXPECT_EQ(zoneColor(stops, 700), QColor(191, 90, 0));
    EXPECT_EQ(zoneColor(stops, 50000), QColor(0, 0, 0));
}

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

TEST(COrvelaStatusIndicator, BarFollowsTheStepAndToolsThePercentage) {
    COrvelaStatusIndicator indicator;
    indicator.resize(201, 40);
    const QColor empty = painted(indicator).pixelColor(10, 2);
    indicator.setStep(1, 4, QStringLiteral("Noise"));
    indicator.setPercentage(20);
    EXPECT_NE(painted(indicator).pixelColor(40, 2), empty);
    EXPECT_EQ(painted(indicator).pixelColor(60, 2), empty);
    indicator.setStep(9, 4);
    EXPECT_EQ(painted(indicator).pixelColor(200, 2), empty) << "at most the width less one";
    indicator.setStep(1, 0);
    EXPECT_EQ(painted(indicator).pixelColor(10, 2), empty);
    QAccessibleInterface* access = QAccessible::queryAccessibleInterface(&indicator);
    EXPECT_EQ(access->valueInterface()->currentValue().toInt(), 20);
    EXPECT_EQ(access->text(QAccessible::Description), QStringLiteral("Noise"));
}

TEST(MessageBoxes, ShowTheEnginesWarnings) {
    installMessageBoxes();
    QString shown;
    QTimer::singleShot(0, [&shown] {
        auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
        ASSERT_TRUE(box);
        shown = box->windowTitle() + QLatin1Char('|') + box->text();
        box->button(QMessageBox::No)->click();
    });
    EXPECT_EQ(DebugBoxes::warningBox(nullptr, QStringLiteral("Note:"), QStringLiteral("text"),
                                     QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes),
              QMessageBox::No);
    DebugBoxes::setPresenter(nullptr);
    EXPECT_EQ(shown, QStringLiteral("Note:|text"));
}

} // namespace
