#include "GUI/Controls/CColorPicker.h"

#include "GUI/Controls/CColorPickerPopup.h"
#include "Painted.h"

#include <QAccessible>
#include <QLabel>
#include <QLineEdit>
#include <QScreen>
#include <QSignalSpy>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class CColorPickerTest : public testing::Test {
protected:
    void SetUp() override {
        picker.show();
        picker.activateWindow();
        ASSERT_TRUE(QTest::qWaitForWindowExposed(&picker));
    }
    QLineEdit* field(const char* name) { return picker.findChild<QLineEdit*>(QString::fromUtf8(name)); }
    QPoint caption(int index) { return picker.findChildren<QLabel*>()[index]->geometry().center(); }
    CColorPickerPopup* popup() { return picker.findChild<CColorPickerPopup*>(); }

    CColorPicker picker;
};

TEST_F(CColorPickerTest, SetColorFillsTheFieldsAndAnnounces) {
    QSignalSpy changed(&picker, &CColorPicker::colorChanged);
    picker.setColor(QColor(1, 20, 255));
    QStringList shown;
    for (const QLineEdit* field : picker.findChildren<QLineEdit*>())
        shown << field->objectName() + field->text();
    EXPECT_EQ(shown, QStringList({"redValue1", "greenValue20", "blueValue255"}));
    for (const QList<QVariant>& call : changed)
        EXPECT_EQ(call[0].value<QColor>(), QColor(1, 20, 255));
    changed.clear();
    picker.setColor(QColor(1, 20, 255)); // no field changes: just the announcement itself
    EXPECT_EQ(changed.count(), 1);
    QAccessibleInterface* access = QAccessible::queryAccessibleInterface(&picker);
    EXPECT_EQ(access->role(), QAccessible::ColorChooser);
    EXPECT_EQ(access->text(QAccessible::Value), "#0114ff");
}

TEST_F(CColorPickerTest, TypedComponentsAreKeptWithin255) {
    QSignalSpy changed(&picker, &CColorPicker::colorChanged);
    const std::pair<const char*, QColor> typed[] = {
        {"redValue", QColor(7, 255, 255)}, {"greenValue", QColor(7, 7, 255)}, {"blueValue", QColor(7, 7, 7)}};
    for (const auto& [name, color] : typed) {
        field(name)->selectAll();
        QTest::keyClicks(field(name), QStringLiteral("7"));
        EXPECT_EQ(picker.color(), color);
    }
    EXPECT_EQ(changed.count(), 3);
    QTest::keyClicks(field("greenValue"), QStringLiteral("00"));
    picker.on_blueValue_changed(QStringLiteral("none"));
    EXPECT_EQ(picker.color(), QColor(7, 255, 0));
}

TEST_F(CColorPickerTest, ThePopupPicksThePixelUnderTheMouse) {
    QTest::mousePress(&picker, Qt::LeftButton, {}, caption(0));
    ASSERT_TRUE(popup()->isVisible());
    EXPECT_TRUE(popup()->hasMouseTracking());
    const QPoint off = popup()->pos() - picker.mapToGlobal(QPoint(17, 0));
    EXPECT_LE(off.manhattanLength(), 4) << "up to the frame that the offscreen platform gives to windows";
    const QImage shown(QStringLiteral(":/Advanced UI/Misc_ColorPicker.png"));
    EXPECT_EQ(popup()->size(), shown.size());
    for (const QPoint& point :
         {QPoint(0, 53), QPoint(60, 53), QPoint(120, 53), QPoint(90, 0), QPoint(0, 119)}) {
        QTest::mouseMove(popup(), point);
        EXPECT_EQ(picker.color(), shown.pixelColor(point));
        EXPECT_EQ(popup()->chosen(), point);
    }
    EXPECT_LT(picker.color().red(), 5) << "the grey ramp starts black";
    QTest::mouseRelease(popup(), Qt::LeftButton, {}, QPoint(-1, 5));
    EXPECT_TRUE(popup()->isVisible()) << "released outside";
    QTest::mouseRelease(popup(), Qt::LeftButton, {}, QPoint(60, 53));
    EXPECT_FALSE(popup()->isVisible());
    EXPECT_FALSE(popup()->hasMouseTracking());
    QTest::mouseClick(&picker, Qt::RightButton, {}, caption(0));
    EXPECT_FALSE(popup()->isVisible());
}

TEST_F(CColorPickerTest, AClickOpensTheFieldForGoodOnEveryCaption) {
    for (int index : {0, 1, 2}) {
        const QPoint there = picker.mapToGlobal(caption(index));
        QTest::mousePress(&picker, Qt::LeftButton, {}, caption(index));
        QTest::mouseRelease(popup(), Qt::LeftButton, {}, popup()->mapFromGlobal(there));
        EXPECT_TRUE(popup()->isVisible()) << index;
        QTest::mouseClick(popup(), Qt::LeftButton, {}, QPoint(100, 60));
        EXPECT_FALSE(popup()->isVisible());
        QTest::mousePress(&picker, Qt::LeftButton, {}, caption(index));
        QTest::mouseMove(popup(), popup()->mapFromGlobal(there) + QPoint(60, 40));
        QTest::mouseRelease(popup(), Qt::LeftButton, {}, QPoint(100, 60));
        EXPECT_FALSE(popup()->isVisible()) << "drawn to a colour";
    }
}

TEST_F(CColorPickerTest, KeysOpenTheFieldAndMoveTheChoice) {
    const QImage field = QImage(QStringLiteral(":/Advanced UI/Misc_ColorPicker.png"));
    const QColor first = field.pixelColor(60, 53);
    picker.setColor(first);
    for (Qt::Key key : {Qt::Key_Escape, Qt::Key_Return}) {
        picker.setFocus();
        QTest::keyClick(&picker, Qt::Key_Space);
        ASSERT_TRUE(popup()->isVisible());
        const QPoint start = popup()->chosen();
        EXPECT_EQ(field.pixelColor(start), first) << "the ring is at the present colour";
        QTest::keyClick(popup(), Qt::Key_Right);
        QTest::keyClick(popup(), Qt::Key_Up, Qt::ControlModifier);
        EXPECT_EQ(popup()->chosen(), start + QPoint(4, -1));
        EXPECT_EQ(picker.color(), field.pixelColor(start + QPoint(4, -1)));
        QTest::keyClick(popup(), key);
        EXPECT_FALSE(popup()->isVisible());
        EXPECT_EQ(picker.color() == first, key == Qt::Key_Escape);
    }
    QTest::keyClick(&picker, Qt::Key_Return);
    for (int count = 0; count < 50; ++count) {
        QTest::keyClick(popup(), Qt::Key_Left);
        QTest::keyClick(popup(), Qt::Key_Down);
    }
    EXPECT_EQ(popup()->chosen(), QPoint(0, 119)) << "stays in the field";
}

TEST_F(CColorPickerTest, TheFieldStaysOnTheScreenAndGoesWithItsPicker) {
    const QRect screen = picker.screen()->availableGeometry();
    picker.move(screen.bottomRight() - QPoint(60, 30));
    const auto open = [this] {
        QTest::mouseClick(&picker, Qt::LeftButton, {}, caption(0));
        EXPECT_TRUE(popup()->isVisible());
    };
    open();
    EXPECT_TRUE(screen.adjusted(0, 0, 2, 2).contains(popup()->geometry()))
        << "up to the frame that the offscreen platform gives to windows";
    picker.setEnabled(false);
    EXPECT_FALSE(popup()->isVisible()) << "a run began";
    picker.setEnabled(true);
    open();
    picker.hide();
    EXPECT_FALSE(popup()->isVisible());
}

TEST_F(CColorPickerTest, IsFramedAllAroundAndFitsItsDigits) {
    picker.setColor(QColor(40, 200, 60));
    picker.clearFocus();
    const QImage image = painted(picker);
    for (const QPoint& edge : {QPoint(50, 0), QPoint(50, 13), QPoint(2, 7), QPoint(99, 7)})
        EXPECT_EQ(image.pixelColor(edge), QColor(Qt::black)) << edge.x() << ',' << edge.y();
    for (int size : {6, 9, 12, 30}) {
        QFont font = picker.font();
        font.setPixelSize(size);
        picker.setFont(font);
        const QFontMetrics digits = field("redValue")->fontMetrics();
        EXPECT_LE(digits.horizontalAdvance("255"), 18) << size;
        EXPECT_LE(QFontInfo(field("redValue")->font()).pixelSize(), size);
        EXPECT_EQ(field("redValue")->font().family(), font.family());
    }
}

} // namespace
