// Undo and redo of what the user does to the sliders, in the real window.

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Presets/CPresetStore.h"
#include "gui/Windows/ProcessingWindow.h"

#include <QAction>
#include <QComboBox>
#include <QLineEdit>
#include <QToolButton>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class Undo : public testing::Test {
protected:
    ProcessingWindow opened{Mode_Advanced, testplanes::noise(48, 32)};

    COrvelaSliderBlockImpl* block(const char* name = "sldrSaturation") {
        return opened.find<COrvelaSliderBlockImpl>(name);
    }
    void undo() { QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier); }
    void redo() { QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier); }
    std::string undoText() { return opened.find<QToolButton>("btnUndo")->text().toStdString(); }
    PresetContent controls() { return CPresetStore::contentOf(&opened.window); }

    // To two thirds of the width, over many places between.
    void drag(COrvelaSliderBlockImpl* dragged) {
        QWidget* slider = dragged->sldrValue;
        QTest::mousePress(slider, Qt::LeftButton, {}, QPoint(3, 3));
        for (int x = 4; x < slider->width() * 2 / 3; x += 5) {
            QMouseEvent move(QEvent::MouseMove, QPointF(x, 3), slider->mapToGlobal(QPointF(x, 3)),
                             Qt::NoButton, Qt::LeftButton, {});
            QCoreApplication::sendEvent(slider, &move);
        }
        QTest::mouseRelease(slider, Qt::LeftButton, {}, QPoint(slider->width() * 2 / 3, 3));
    }
};

TEST_F(Undo, ADragIsOneStepAndSoAreRepeatedKeys) {
    opened.run([&] {
        EXPECT_FALSE(opened.find("btnUndo")->isEnabled());
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
        auto* presets = opened.find<QComboBox>("lstBxPreset");
        presets->setCurrentText(QStringLiteral("Automatic"));
        const PresetContent automatic = controls();
        presets->setCurrentText(QStringLiteral("LandscapePro"));
        const PresetContent landscape = controls();
        ASSERT_NE(automatic, landscape);
        EXPECT_EQ(undoText(), "Undo: preset LandscapePro");
        opened.click("btnTurnAllOff");
        EXPECT_EQ(undoText(), "Undo: all sliders off");
        undo();
        EXPECT_EQ(controls(), landscape) << "with every exact position";
        undo();
        EXPECT_EQ(controls(), automatic);
        EXPECT_EQ(presets->currentText(), "Automatic");
        redo();
        EXPECT_EQ(controls(), landscape);
        EXPECT_EQ(presets->currentText(), "LandscapePro");
        opened.click("btnOK");
    });
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(Mode_LandscapePro)));
}

TEST_F(Undo, ATypedNumberIsUndoneFromWithinItsField) {
    opened.run([&] {
        opened.window.activateWindow();
        block()->setEnabled(true);
        const PresetContent before = controls();
        QLineEdit* field = block()->txtValue;
        field->setFocus();
        field->selectAll();
        QTest::keyClicks(field, QStringLiteral("4.5"));
        EXPECT_NE(controls(), before);
        QTest::keyClick(field, Qt::Key_Z, Qt::ControlModifier);
        EXPECT_EQ(controls(), before);
        QTest::keyClick(field, Qt::Key_Y, Qt::ControlModifier);
        EXPECT_EQ(field->text(), "4.5");
        opened.click("btnCancel");
    });
}

TEST_F(Undo, NothingIsUndoneDuringARunOrAcrossModes) {
    opened.run([&] {
        block()->setEnabled(true);
        drag(block());
        const PresetContent moved = controls();
        int tries = 0;
        const auto tried = QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [&] {
            EXPECT_FALSE(opened.find("btnUndo")->isEnabled());
            undo();
            ++tries;
        });
        opened.click("btnRefresh");
        QObject::disconnect(tried);
        EXPECT_GT(tries, 20);
        EXPECT_EQ(controls(), moved);
        EXPECT_TRUE(opened.find("btnUndo")->isEnabled());
        opened.click("btnFinalTouch");
        EXPECT_FALSE(opened.find("btnUndo")->isEnabled());
        EXPECT_TRUE(QTest::qWaitFor([&] { return opened.find("btnBack")->isEnabled(); }, 5000));
        opened.click("btnBack");
        EXPECT_FALSE(opened.find("btnUndo")->isEnabled());
        opened.click("btnCancel");
    });
}

} // namespace
