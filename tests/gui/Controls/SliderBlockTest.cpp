#include "GUI/Controls/COrvelaSliderBlockImpl.h"

#include <QAccessible>
#include <QApplication>
#include <QClipboard>
#include <QSignalSpy>
#include <QTest>
#include <QToolTip>
#include <QVBoxLayout>
#include <QWheelEvent>

#include <gtest/gtest.h>

#include <cmath>

using namespace orvela;

namespace {

/// A block with the scale "tenth" (0 to 100), shown in an active window with a second block below it.
class SliderBlock : public testing::Test {
protected:
    void SetUp() override {
        auto* layout = new QVBoxLayout(&window);
        layout->addWidget(&block);
        layout->addWidget(&next);
        block.setScale(SliderScales::Tenth);
        block.setMinMax(0, 100);
        block.setText(QStringLiteral("Fade"));
        window.resize(400, 120);
        window.show();
        window.activateWindow();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&window));
    }

    CThinHorizontalSlider* slider() { return block.sldrValue; }
    std::string text() { return block.txtValue->text().toStdString(); }
    /// Replaces the text as a user does.
    void type(const char* keys) {
        block.txtValue->setFocus();
        block.txtValue->selectAll();
        QTest::keyClicks(block.txtValue, QString::fromUtf8(keys));
    }
    /// Types, presses Enter and tells what the field then holds.
    std::string enter(const char* keys) {
        type(keys);
        QTest::keyClick(block.txtValue, Qt::Key_Return);
        return text();
    }
    void wheel(int angle) {
        const QPointF middle = QRectF(slider()->rect()).center();
        QWheelEvent event(middle, slider()->mapToGlobal(middle), {}, {0, angle}, Qt::NoButton, {},
                          Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(slider(), &event);
    }

    QWidget window;
    COrvelaSliderBlockImpl block{&window};
    COrvelaSliderBlockImpl next{&window};
};

TEST_F(SliderBlock, PositionsSnapToWhatOneDecimalTells) {
    QSignalSpy changed(&block, &COrvelaSliderBlockImpl::valueChanged);
    block.setScale(SliderScales::Shadows);
    block.setValue(500); // shows 127.5, which is position 500 (up to rounding)
    EXPECT_EQ(text(), "127.5");
    EXPECT_NEAR(block.value(), 500, 1e-9);
    block.setValue(501); // shows 127.755 as 127.8, which is 501.176...
    EXPECT_EQ(text(), "127.8");
    EXPECT_NEAR(block.value(), 127.8 / 0.255, 1e-9);
    block.setValue(501.1); // the same text: nothing is derived anew
    EXPECT_EQ(block.value(), 501.1);
    EXPECT_EQ(changed.count(), 2);
    block.setVirtualValue(63.75);
    EXPECT_EQ(text(), "63.8");
    EXPECT_NEAR(block.value(), 63.8 / 0.255, 1e-9);
}

TEST_F(SliderBlock, DraggingMovesTheTextAndAnnouncesOnceAtRelease) {
    QSignalSpy changed(&block, &COrvelaSliderBlockImpl::valueChanged);
    const int last = slider()->width() - 1;
    const auto shown = [last](int x) { return QString::number(100.0 / last * x, 'f', 1).toStdString(); };
    QTest::mousePress(slider(), Qt::LeftButton, {}, QPoint(1 + last / 4, 3));
    EXPECT_EQ(text(), shown(last / 4));
    QTest::mouseMove(slider(), QPoint(1 + last / 2, 3));
    EXPECT_EQ(text(), shown(last / 2));
    EXPECT_EQ(changed.count(), 0);
    QTest::mouseRelease(slider(), Qt::LeftButton, {}, QPoint(1 + last / 2, 3));
    EXPECT_FALSE(slider()->isDragging() || slider()->hasMouseTracking());
    ASSERT_EQ(changed.count(), 1);
    EXPECT_DOUBLE_EQ(changed[0][0].toDouble(), 1000.0 / last * (last / 2));
    QTest::mousePress(slider(), Qt::LeftButton, {}, QPoint(0, 3)); // left of the scale's first pixel
    EXPECT_EQ(block.value(), 0);
    QTest::mouseRelease(slider(), Qt::LeftButton, {}, QPoint(last + 50, 3));
    EXPECT_EQ(block.value(), 1000);
    QTest::mousePress(slider(), Qt::LeftButton, {}, QPoint(0, 3));
    block.setEnabled(false);
    EXPECT_FALSE(slider()->isDragging()) << "a release will not come any more";
}

TEST_F(SliderBlock, TheWholeHeightOfTheRowTakesTheMouse) {
    const QRect thin = slider()->geometry();
    ASSERT_GT(thin.top(), 2);
    block.txtValue->setFocus();
    QTest::mousePress(&block, Qt::LeftButton, {}, QPoint(thin.right(), 1));
    EXPECT_TRUE(slider()->isDragging() && slider()->hasFocus());
    QTest::mouseRelease(&block, Qt::LeftButton, {}, QPoint(thin.center().x(), block.height() - 1));
    EXPECT_FALSE(slider()->isDragging());
    const std::string middle = text();
    QTest::mouseClick(&block, Qt::LeftButton, {}, QPoint(thin.left() - 3, 1)); // beside the slider
    block.setEnabled(false);
    QTest::mouseClick(&block, Qt::LeftButton, {}, QPoint(thin.right(), 1));
    EXPECT_EQ(text(), middle);
}

TEST_F(SliderBlock, TypedTextMovesTheSliderAtEveryKey) {
    QSignalSpy changed(&block, &COrvelaSliderBlockImpl::valueChanged);
    type("42.5");
    EXPECT_EQ(changed.count(), 4); // 4, 42, 42., 42.5
    EXPECT_EQ(block.value(), 425);
    type("-1");
    EXPECT_EQ(text(), "1") << "the range has nothing negative";
    QApplication::clipboard()->setText(QStringLiteral("12.5"));
    block.txtValue->selectAll();
    QTest::keySequence(block.txtValue, QKeySequence::Paste);
    EXPECT_EQ(block.value(), 125);
}

TEST_F(SliderBlock, FinishingCutsToOneDecimalAndResetsOutOfRangeToTheBottom) {
    type("5000");
    EXPECT_EQ(block.value(), 50000);
    EXPECT_EQ(enter("5000"), "0");
    EXPECT_EQ(block.value(), 0);
    EXPECT_EQ(QToolTip::text(), QStringLiteral("Fade shall be in range: 0 to 100"));
    EXPECT_EQ(enter("12.75"), "12.8");
    type("1e999");
    EXPECT_EQ(block.value(), 0);
    next.txtValue->setFocus();
    EXPECT_EQ(text(), "0");
    EXPECT_TRUE(block.txtValue->hasFocus()) << "the field takes the focus back";
    block.setScale(SliderScales::Temperature);
    block.setMinMax(10000, 2000.5);
    for (const char* typed : {"2000", "10001", "e", "-"})
        EXPECT_EQ(enter(typed), "2000.5") << typed;
    EXPECT_EQ(enter("10000"), "10000");
}

TEST_F(SliderBlock, DoubleClickAnywhereSwitchesOnAndOff) {
    QSignalSpy state(&block, &COrvelaSliderBlockImpl::stateChanged);
    const QPoint parts[] = {block.lblName->geometry().center(), slider()->geometry().center(),
                            block.txtValue->geometry().center()};
    for (int round = 0; round < 6; ++round) {
        const bool on = round % 2 == 1;
        QTest::mouseDClick(window.windowHandle(), Qt::LeftButton, {}, block.mapTo(&window, parts[round / 2]));
        ASSERT_EQ(state.count(), 1) << round;
        EXPECT_EQ(state.takeLast()[0].toBool(), on) << round;
        EXPECT_TRUE(slider()->isEnabled() == on && block.txtValue->isEnabled() == on);
        EXPECT_EQ(block.txtValue->font().italic(), !on);
        EXPECT_TRUE(block.lblName->isEnabled() && !slider()->isDragging());
    }
    window.setEnabled(false); // the surroundings do not count
    block.setEnabled(true);
    EXPECT_TRUE(state.isEmpty()) << "no change, no signal";
    block.setEnabled(false);
    window.setEnabled(true);
    EXPECT_FALSE(slider()->isEnabled());
}

TEST_F(SliderBlock, KeysAndWheelMoveTheFocusedSlider) {
    slider()->setFocus();
    const std::pair<Qt::Key, double> steps[] = {
        {Qt::Key_End, 1000},  {Qt::Key_PageDown, 900}, {Qt::Key_Left, 890},    {Qt::Key_Down, 880},
        {Qt::Key_Right, 890}, {Qt::Key_Up, 900},       {Qt::Key_PageUp, 1000}, {Qt::Key_Home, 0}};
    for (const auto& [key, position] : steps) {
        QTest::keyClick(slider(), key);
        EXPECT_EQ(block.value(), position) << key;
    }
    wheel(60);
    EXPECT_EQ(block.value(), 0) << "half a notch";
    wheel(60);
    EXPECT_EQ(block.value(), 10);
    next.sldrValue->setFocus();
    wheel(120);
    EXPECT_EQ(block.value(), 10) << "without the focus";
}

TEST_F(SliderBlock, AKeyAlwaysMovesTheShownNumber) {
    slider()->setFocus();
    for (const SliderScale* scale :
         {&SliderScales::Thousandth, &SliderScales::Gamma, &SliderScales::Highlights}) {
        block.setScale(*scale);
        for (const auto& [key, end] : {std::pair(Qt::Key_Left, 0.0), std::pair(Qt::Key_Right, 1000.0)}) {
            for (int count = 0; std::abs(block.value() - end) > 0.01 && count < 300; ++count) {
                const std::string before = text();
                QTest::keyClick(slider(), key);
                EXPECT_NE(text(), before);
            }
            EXPECT_NEAR(block.value(), end, 0.01);
        }
    }
}

TEST_F(SliderBlock, TabVisitsSliderThenTextThenTheNextBlock) {
    slider()->setFocus();
    for (QWidget* widget : QList<QWidget*>{block.txtValue, next.sldrValue, next.txtValue}) {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        EXPECT_EQ(QApplication::focusWidget(), widget);
    }
}

TEST_F(SliderBlock, TellsAssistiveToolsNameRoleAndValue) {
    block.setValue(250);
    QAccessibleInterface* access = QAccessible::queryAccessibleInterface(slider());
    ASSERT_TRUE(access && access->valueInterface());
    EXPECT_EQ(access->role(), QAccessible::Slider);
    EXPECT_EQ(access->text(QAccessible::Name), QStringLiteral("Fade"));
    EXPECT_EQ(access->text(QAccessible::Value), QStringLiteral("25.0"));
    access->valueInterface()->setCurrentValue(2000);
    EXPECT_EQ(text(), "100.0");
    block.setEnabled(false);
    access->valueInterface()->setCurrentValue(500);
    EXPECT_EQ(block.value(), 1000);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(&block)->role(), QAccessible::Grouping);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(block.txtValue)->text(QAccessible::Name),
              QStringLiteral("Fade"));
}

} // namespace
