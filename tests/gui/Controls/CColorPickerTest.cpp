#include "GUI/Controls/CColorPicker.h"

#include "GUI/Controls/CColorPickerPopup.h"

#include <QAccessible>
#include <QLineEdit>
#include <QSignalSpy>
#include <QTest>

#include <gtest/gtest.h>

namespace {

class CColorPickerTest : public testing::Test {
protected:
    void SetUp() override {
        picker.show();
        picker.activateWindow();
        ASSERT_TRUE(QTest::qWaitForWindowExposed(&picker));
    }
    QLineEdit* field(const char* name) { return picker.findChild<QLineEdit*>(QString::fromUtf8(name)); }
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
    QTest::mousePress(&picker, Qt::LeftButton, {}, QPoint(8, 7)); // on the letter R
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
    }
    EXPECT_LT(picker.color().red(), 5) << "the grey ramp starts black";
    QTest::mouseRelease(popup(), Qt::LeftButton, {}, QPoint(-1, 5));
    EXPECT_TRUE(popup()->isVisible()) << "released outside";
    QTest::mouseRelease(popup(), Qt::LeftButton, {}, QPoint(60, 53));
    EXPECT_FALSE(popup()->isVisible());
    EXPECT_FALSE(popup()->hasMouseTracking());
}

} // namespace
