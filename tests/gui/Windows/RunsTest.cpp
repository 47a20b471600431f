// What becomes of changes, OK, files and boxes that come while the processing window's core runs, and of the
// timers around its runs.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Presets/CBatchMode.h"
#include "gui/Windows/RunsFixture.h"
#include "support/ModalDialog.h"

#include <cmath>

using namespace orvela;

namespace {

TEST_F(Runs, OfABatchAreWholeHoweverLongTheyTake) {
    opened.run([&] {
        opened.click("btnRefresh");
        opened.click("btnFinalTouch");
        block("sldrPercContrast")->setEnabled(true);
        block("sldrPercContrast")->setValue(700);
        opened.click("btnOK");
    });
    ASSERT_EQ(CBatchMode::instance().batchMode(), Mode_FinalTouch);
    CBatchMode::instance().setBatchModeEnabled(true);
    std::vector<std::vector<std::uint8_t>> results;
    for (const int wait : {1, kLong}) {
        ProcessingWindow batch(Mode_Batch, testplanes::noise(72, 48));
        batch.run([wait] { QTest::qWait(wait); });
        EXPECT_TRUE(batch.window.appliesOnFinish());
        for (const TaskReport& report : batch.core()->reports())
            EXPECT_NE(report.outcome, TaskOutcome::Cancelled) << report.name;
        results.push_back(testplanes::bytes(batch.output));
    }
    EXPECT_TRUE(results[0] == results[1]);
    EXPECT_FALSE(results[0] == testplanes::bytes(opened.proxy.plane()));
}

TEST_F(Runs, LeaveNothingInUseThatChangesTheSettingsOrOpensABox) {
    opened.run([&] {
        block()->setValue(130); // which could be undone
        int tried = 0;
        during([&] {
            const PresetContent before = controls();
            const QString preset = opened.presets()->currentText();
            QTest::keyClick(opened.presets(), Qt::Key_Down);
            opened.click("btnTurnAllOn");
            opened.click("btnTurnAllOff");
            for (const char* keys : {"Ctrl+E", "Ctrl+Shift+E", "Ctrl+R", "Ctrl+S", "Ctrl+D", "Ctrl+Z"})
                QTest::keySequence(&opened.window, QKeySequence(QLatin1String(keys)));
            EXPECT_EQ(QApplication::activeModalWidget(), &opened.window);
            EXPECT_FALSE(opened.find("btnRefresh")->isVisible());
            EXPECT_EQ(controls(), before);
            EXPECT_EQ(opened.presets()->currentText(), preset);
            ++tried;
        });
        opened.click("btnRefresh");
        EXPECT_EQ(tried, 1);
        for (const char* name :
             {"lstBxPreset", "btnTurnAllOn", "btnSavePreset", "chkBxAutoRefresh", "btnUndo", "btnRefresh"})
            EXPECT_TRUE(opened.find(name)->isEnabled() && opened.find(name)->isVisible()) << name;
        opened.click("btnOK");
    });
    expectWholeResult();
}

TEST_F(Runs, CanBeStoppedEachTime) {
    opened.run([&] {
        int stopped = 0;
        for (int round = 1; round <= 2; ++round) {
            during([&] {
                EXPECT_TRUE(opened.find("btnStopProcessing")->isVisible());
                EXPECT_TRUE(opened.find("btnStopProcessing")->isEnabled());
                opened.click("btnStopProcessing");
                ++stopped;
            });
            opened.click("btnRefresh");
            EXPECT_EQ(stopped, round);
        }
        opened.click("btnCancel");
    });
}

TEST_F(Runs, ReadAThumbThatIsHeldWhereItComesToStand) {
    opened.run([&] {
        block("sldrIllumination")->setEnabled(true);
        auto* thumb = block("sldrIllumination")->sldrValue;
        int x = thumb->width() / 3;
        QTest::mousePress(thumb, Qt::LeftButton, {}, QPoint(x, 3));
        while (std::fmod(thumb->value(), 10) < 0.1 && ++x < thumb->width()) // tenths of its scale are told
            moveHeldMouse(thumb, QPointF(x, 3));
        ASSERT_LT(x, thumb->width());
        QTest::keyClick(&opened.window, Qt::Key_F5);
        EXPECT_EQ(opened.core()->params().mSliderParams.ClarityFilterValue,
                  settings().mSliderParams.ClarityFilterValue);
        opened.click("btnCancel");
    });
}

TEST_F(Runs, AreFollowedByAllThatWaitsForTheirEnd) {
    const QUrl flash = file(R"({"version": 1, "settings": {"DigitalFlashEnabled": true}})");
    opened.run([&] {
        during([&] {
            const PresetContent before = controls();
            EXPECT_TRUE(drop(&opened.window, {flash}));
            EXPECT_EQ(controls(), before);
            opened.click("btnOK");
        });
        opened.click("btnRefresh");
        EXPECT_TRUE(opened.window.isVisible());
    });
    EXPECT_TRUE(settings().mSliderParams.DigitalFlashEnabled);
    EXPECT_FALSE(settings().mSliderParams.SaturationEnabled);
    expectWholeResult();
}

TEST_F(Runs, ByOkAreMadeAnewOfWhatIsChosenMeanwhile) {
    opened.run([&] {
        during([&] { opened.presets()->setCurrentText(QStringLiteral("Landscape")); });
        opened.click("btnOK");
    });
    expectWholeResult();
}

TEST_F(Runs, ByOkAreNotSpoiltByTheRefreshThatWasToCome) {
    opened.run([&] {
        countRuns();
        opened.click("chkBxAutoRefresh");
        QTest::qWait(1);
        block()->setValue(130);
        during([&] { opened.letTheSecondPass(); });
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 1);
    expectWholeResult();
}

TEST_F(Runs, DoNotBeginByThemselvesWithASliderInHandOrBehindAnythingOpen) {
    opened.run([&] {
        countRuns();
        opened.click("chkBxAutoRefresh");
        block()->setValue(130);
        int tried = 0;
        const auto expectNone = [&] {
            opened.letTheSecondPass();
            EXPECT_EQ(runs, 0);
            ++tried;
        };
        block("sldrIllumination")->setEnabled(true);
        QWidget* thumb = block("sldrIllumination")->sldrValue;
        QTest::mousePress(thumb, Qt::LeftButton, {}, QPoint(30, 3));
        expectNone();
        EXPECT_TRUE(thumb->isEnabled());
        QTest::mouseRelease(thumb, Qt::LeftButton, {}, QPoint(30, 3));
        opened.presets()->showPopup();
        expectNone();
        opened.presets()->hidePopup();
        {
            const ModalDialogs user([&](QDialog& dialog) {
                if (&dialog == &opened.window)
                    return;
                expectNone();
                dialog.reject();
            });
            opened.click("btnSavePreset");
        }
        EXPECT_EQ(tried, 3);
        opened.letTheSecondPass();
        EXPECT_EQ(runs, 1) << "it was forgotten";
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 1) << "what is shown is what is asked for";
    expectWholeResult();
}

} // namespace
