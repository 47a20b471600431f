// Undo and redo of what the user does to the sliders, in the real window.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "gui/Windows/RunsFixture.h"

using namespace orvela;

namespace {

class Undo : public Runs {
protected:
    void undo() { QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier); }
    void redo() { QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier); }
    std::string undoText() { return opened.find<QToolButton>("btnUndo")->text().toStdString(); }

    // To two thirds of the width, over many places between.
    static void drag(COrvelaSliderBlockImpl* dragged) {
        QWidget* slider = dragged->sldrValue;
        QTest::mousePress(slider, Qt::LeftButton, {}, QPoint(3, 3));
        for (int x = 4; x < slider->width() * 2 / 3; x += 5)
            moveHeldMouse(slider, QPointF(x, 3));
        QTest::mouseRelease(slider, Qt::LeftButton, {}, QPoint(slider->width() * 2 / 3, 3));
    }
};

TEST_F(Undo, ADragIsOneStepAndSoAreRepeatedKeys) {
    opened.run([&] {
        EXPECT_EQ(undoText(), "Undo");
        block()->setEnabled(true);
        block("sldrDigitalFlash")->setEnabled(true);
        const double first = block()->value();
        drag(block());
        const double second = block()->value();
        drag(block("sldrDigitalFlash"));
        drag(block()); // to where it is
        for (int i = 0; i < 5; ++i)
            QTest::keyClick(block()->sldrValue, Qt::Key_Right);
        const double last = block()->value();
        EXPECT_GT(last, second);
        EXPECT_EQ(undoText(), "Undo: " + block()->lblName->text().toStdString());
        undo();
        EXPECT_EQ(block()->value(), second) << "all five keys at once";
        undo();
        EXPECT_EQ(undoText(), "Undo: " + block()->lblName->text().toStdString());
        undo();
        EXPECT_EQ(block()->value(), first);
        redo();
        EXPECT_EQ(block()->value(), second);
        redo();
        redo();
        EXPECT_EQ(block()->value(), last);
        EXPECT_FALSE(opened.find("btnRedo")->isEnabled());
        undo();
        QTest::keyClick(block("sldrDigitalFlash")->sldrValue, Qt::Key_Home);
        EXPECT_FALSE(opened.find("btnRedo")->isEnabled()) << "another way was taken";
        opened.click("btnCancel");
    });
}

TEST_F(Undo, ADoubleClickIsTheSwitchAlone) {
    opened.run([&] {
        block()->setEnabled(true);
        QTest::keyClick(block()->sldrValue, Qt::Key_Home);
        QTest::qWait(1100); // that move is over
        const PresetContent before = controls();
        QWidget* slider = block()->sldrValue;
        QTest::mouseDClick(slider, Qt::LeftButton, {}, QPoint(slider->width() / 2, 3));
        EXPECT_FALSE(block()->isEnabled());
        EXPECT_EQ(block()->value(), 0);
        EXPECT_EQ(undoText(), "Undo: " + block()->lblName->text().toStdString() + " off");
        undo();
        EXPECT_EQ(controls(), before);
        opened.click("btnCancel");
    });
}

TEST_F(Undo, APresetIsOneStepAndItsNameComesBack) {
    opened.run([&] {
        const PresetContent automatic = controls();
        opened.presets()->setCurrentText(QStringLiteral("LandscapePro"));
        const PresetContent landscape = controls();
        ASSERT_NE(automatic, landscape);
        EXPECT_EQ(undoText(), "Undo: preset LandscapePro");
        opened.click("btnTurnAllOff");
        EXPECT_EQ(undoText(), "Undo: all sliders off");
        undo();
        EXPECT_EQ(controls(), landscape) << "with every exact position";
        undo();
        EXPECT_EQ(controls(), automatic);
        EXPECT_EQ(opened.presets()->currentText(), "Automatic");
        redo();
        EXPECT_EQ(controls(), landscape);
        EXPECT_EQ(opened.presets()->currentText(), "LandscapePro");
        opened.click("btnCancel");
    });
}

} // namespace
