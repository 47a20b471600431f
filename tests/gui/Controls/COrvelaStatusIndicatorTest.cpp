#include "GUI/Controls/COrvelaStatusIndicator.h"

#include "Painted.h"

#include <QAccessible>

#include <gtest/gtest.h>

using namespace orvela;

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
