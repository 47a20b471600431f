// What becomes of changes, OK, files and boxes that come while the processing window's core runs, and of the
// timers around its runs.

#include "Core/CThreadedCore_FinalTouch.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CBatchMode.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Preview/CGridCell.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/BoxRecorder.h"
#include "support/LogCapture.h"
#include "support/ModalDialog.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDropEvent>
#include <QMessageBox>
#include <QMimeData>
#include <QPushButton>
#include <QScrollBar>
#include <QTemporaryDir>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

constexpr int kLong = 1300; // milliseconds: the refresh that comes by itself would have come

class Runs : public testing::Test {
protected:
    explicit Runs(EGUIMode mode = Mode_Advanced) : opened(mode, testplanes::noise(72, 48)) {}
    Runs(const Runs&) = delete;
    ~Runs() override { openSettings().clear(); }

    COrvelaSliderBlockImpl* block(const char* name) { return opened.find<COrvelaSliderBlockImpl>(name); }
    void countRuns() {
        QObject::connect(opened.core(), &CThreadedCore::started, &opened.window, [this] { ++runs; });
    }

    // Once, at a step of the run that comes next.
    void during(const std::function<void()>& user, int at = 3) {
        auto once = std::make_shared<bool>(false);
        QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [=](int step) {
            if (step == at && !std::exchange(*once, true))
                user();
        });
    }

    CUserParamsPhotoshop settings() {
        CUserParamsPhotoshop params(Mode_Advanced);
        opened.window.findChild<IWgtPane*>()->applyGUIParams(params);
        return params;
    }

    // The picture that OK leaves is what the settings, as they stand in the window, ask for.
    void expectWholeResult() {
        EXPECT_TRUE(opened.window.appliesOnFinish());
        EXPECT_TRUE(testplanes::bytes(opened.output) == opened.engineResult(settings()));
    }

    QString file(const QByteArray& content) {
        const QString path = mFolder.filePath(QStringLiteral("dropped.json"));
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
        return path;
    }
    static void drop(QWidget* at, const QString& path) {
        QMimeData dragged;
        dragged.setUrls({QUrl::fromLocalFile(path)});
        QDragEnterEvent enter(QPoint(2, 2), Qt::CopyAction, &dragged, Qt::LeftButton, {});
        QApplication::sendEvent(at, &enter);
        QDropEvent event(QPoint(2, 2), Qt::CopyAction, &dragged, Qt::LeftButton, {});
        QApplication::sendEvent(at, &event);
    }

    ProcessingWindow opened;
    int runs = 0;

private:
    QTemporaryDir mFolder;
};

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

    ProcessingWindow stopped(Mode_Batch, testplanes::noise(72, 48));
    stopped.run([&stopped] { stopped.click("btnStopProcessing"); });
    EXPECT_FALSE(stopped.window.appliesOnFinish());
}

TEST_F(Runs, LeaveNothingInUseThatChangesTheSettingsOrOpensABox) {
    opened.run([&] {
        int tried = 0;
        during([&] {
            const PresetContent before = CPresetStore::contentOf(&opened.window);
            const QString preset = opened.find<QComboBox>("lstBxPreset")->currentText();
            QTest::keyClick(opened.find("lstBxPreset"), Qt::Key_Down);
            opened.click("btnTurnAllOn");
            opened.click("btnTurnAllOff");
            for (const char* keys : {"Ctrl+E", "Ctrl+Shift+E", "Ctrl+R", "Ctrl+S", "Ctrl+D", "Ctrl+Z"})
                QTest::keySequence(&opened.window, QKeySequence(QLatin1String(keys)));
            EXPECT_EQ(QApplication::activeModalWidget(), &opened.window);
            EXPECT_EQ(CPresetStore::contentOf(&opened.window), before);
            EXPECT_EQ(opened.find<QComboBox>("lstBxPreset")->currentText(), preset);
            ++tried;
        });
        opened.click("btnRefresh");
        EXPECT_EQ(tried, 1);
        for (const char* name : {"lstBxPreset", "btnTurnAllOn", "btnSavePreset", "chkBxAutoRefresh"})
            EXPECT_TRUE(opened.find(name)->isEnabled()) << name;
        opened.click("btnOK");
    });
    expectWholeResult();
}

TEST_F(Runs, CountForNothingWhenASettingChangedMeanwhile) {
    opened.run([&] {
        countRuns();
        during([&] { block("sldrSaturation")->setValue(130); });
        opened.click("btnRefresh"); // its result is not that of the settings
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 2);
    expectWholeResult();
}

TEST_F(Runs, ThatOkAskedForAreRepeatedWhenASettingChangedMeanwhile) {
    opened.run([&] {
        countRuns();
        during([&] { block("sldrSaturation")->setValue(130); });
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 2);
    expectWholeResult();
}

TEST_F(Runs, ReadAThumbThatIsHeldWhereItComesToStand) {
    opened.run([&] {
        block("sldrIllumination")->setEnabled(true); // hundredths: most pixels are no number that is told
        QWidget* thumb = block("sldrIllumination")->sldrValue;
        QTest::mousePress(thumb, Qt::LeftButton, {}, QPoint(thumb->width() / 3, 3));
        QTest::keyClick(&opened.window, Qt::Key_F5);
        EXPECT_EQ(opened.core()->params().mSliderParams.ClarityFilterValue,
                  settings().mSliderParams.ClarityFilterValue);
        opened.click("btnOK");
    });
    expectWholeResult();
}

class RunsAndOk : public Runs, public testing::WithParamInterface<bool> {};

TEST_P(RunsAndOk, StoppedForADroppedFileAreMadeAnew) {
    const bool pressedBefore = GetParam();
    QStringList said;
    const ModalDialogs reader([&said](QDialog& dialog) {
        if (auto* box = qobject_cast<QMessageBox*>(&dialog)) {
            said += box->text();
            box->accept();
        }
    });
    opened.run([&] {
        during([&] { drop(&opened.window, file("no preset")); });
        opened.click(pressedBefore ? "btnOK" : "btnRefresh");
        if (pressedBefore)
            return;
        EXPECT_TRUE(QTest::qWaitFor([&] { return !said.isEmpty(); }));
        opened.click("btnOK");
    });
    EXPECT_EQ(said.size(), 1);
    expectWholeResult();
}

INSTANTIATE_TEST_SUITE_P(BeforeAndAfter, RunsAndOk, testing::Bool());

TEST_F(Runs, AreFollowedByAllThatWaitsForTheirEnd) {
    const QString flash = file(R"({"version": 1, "settings": {"DigitalFlashEnabled": true}})");
    opened.run([&] {
        during([&] {
            drop(&opened.window, flash);
            opened.click("btnOK");
        });
        opened.click("btnRefresh");
        EXPECT_TRUE(opened.window.isVisible());
    });
    EXPECT_TRUE(settings().mSliderParams.DigitalFlashEnabled);
    EXPECT_FALSE(settings().mSliderParams.SaturationEnabled);
    expectWholeResult();
}

TEST_F(Runs, ByOkAreNotSpoiltByTheRefreshThatWasToCome) {
    opened.run([&] {
        countRuns();
        opened.click("chkBxAutoRefresh");
        QTest::qWait(1);
        block("sldrSaturation")->setValue(130);
        during([] { QTest::qWait(kLong); });
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 1);
    expectWholeResult();
}

TEST_F(Runs, DoNotBeginBehindABox) {
    opened.run([&] {
        countRuns();
        opened.click("chkBxAutoRefresh");
        block("sldrSaturation")->setValue(130);
        bool asked = false;
        const ModalDialogs user([&](QDialog& dialog) {
            if (&dialog == &opened.window)
                return;
            asked = true;
            QTest::qWait(kLong);
            EXPECT_EQ(runs, 0);
            dialog.reject();
        });
        opened.click("btnSavePreset");
        EXPECT_TRUE(asked);
        EXPECT_TRUE(QTest::qWaitFor([&] { return runs == 1; }, 3000)) << "it was forgotten";
        opened.click("btnCancel");
    });
}

TEST_F(Runs, DoNotBeginOnAWindowThatWasClosed) {
    opened.run([&] {
        countRuns();
        during([&] { opened.window.on_btnRefresh_clicked(); });
        opened.click("btnRefresh"); // another one is to come
        opened.click("btnCancel");
        QTest::qWait(50);
        opened.window.on_btnRefresh_clicked();
    });
    EXPECT_EQ(runs, 1);
    EXPECT_FALSE(opened.window.appliesOnFinish());
}

TEST_F(Runs, GiveTheKeyboardBackToWhereItWas) {
    opened.run([&] {
        opened.window.activateWindow();
        opened.click("chkBxAutoRefresh");
        QWidget* slider = block("sldrSaturation")->sldrValue;
        slider->setFocus();
        countRuns();
        during([&] {
            EXPECT_NE(opened.window.focusWidget(), slider);
            QTest::keyClick(opened.window.focusWidget(), Qt::Key_Right); // of a key that is held
        });
        QTest::keyClick(slider, Qt::Key_Right);
        EXPECT_TRUE(QTest::qWaitFor([&] { return runs == 1; }, 3000));
        EXPECT_TRUE(QTest::qWaitFor([&] { return opened.window.focusWidget() == slider; }, 1000));

        opened.find("lstBxPreset")->setFocus();
        opened.click("chkBxAutoRefresh");
        opened.click("btnTurnAllOn");
        during([&] { opened.find("btnZoomIn")->setFocus(); }); // the user goes elsewhere
        QTest::keyClick(&opened.window, Qt::Key_F5);
        EXPECT_EQ(opened.window.focusWidget(), opened.find("btnZoomIn"));

        block("sldrSaturation")->setValue(130);
        opened.find("btnOK")->setFocus();
        during([&] { QTest::keyClick(opened.window.focusWidget(), Qt::Key_Space); }); // twice, by mistake
        QTest::keyClick(opened.find("btnOK"), Qt::Key_Space);
    });
    expectWholeResult();
}

TEST_F(Runs, OfTheNextPaneFollowTheResultsOfTheOneBefore) {
    opened.run([&] {
        auto* refresh = opened.find("btnRefresh");
        EXPECT_TRUE(refresh->isVisible());
        opened.click("btnRefresh");
        opened.click("btnFinalTouch");
        EXPECT_FALSE(refresh->isVisible());
        countRuns();
        EXPECT_TRUE(QTest::qWaitFor([&] { return runs == 1; }, 3000));
        opened.click("btnBack");
        EXPECT_TRUE(refresh->isVisible()) << "or nothing would be processed any more";

        opened.click("btnRefresh");
        block("sldrSaturation")->setValue(130);
        opened.click("btnFinalTouch");
        EXPECT_TRUE(refresh->isVisible());
        countRuns();
        QTest::qWait(kLong);
        EXPECT_EQ(runs, 1) << "begun from a result that is not that of the settings";
        opened.click("btnRefresh");
        EXPECT_EQ(runs, 2);
        opened.click("btnBack");
        opened.click("btnRefresh");
        opened.click("chkBxAutoRefresh");
        opened.click("btnFinalTouch");
        EXPECT_TRUE(QTest::qWaitFor([&] { return opened.find("btnBack")->isEnabled(); }, 3000));
        opened.click("btnBack");
        EXPECT_TRUE(opened.find<QCheckBox>("chkBxAutoRefresh")->isChecked());
        opened.click("btnCancel");
    });
}

// A proxy that the filters which look at the host's picture cannot use.
struct UselessProxy final : CARGBPlaneProxy {
    void getPixels(int, int, int, int, void*, int) override {}
};

TEST_F(Runs, TellOnceOfAStepThatFailedAndAskBeforeItsPictureIsUsed) {
    UselessProxy useless;
    const auto breakFlash = [&] {
        block("sldrDigitalFlash")->setEnabled(true);
        opened.core()->setProxy(&useless);
    };
    opened.run([&] {
        breakFlash();
        QStringList told = boxes([&] { opened.click("btnRefresh"); });
        ASSERT_EQ(told.size(), 1);
        EXPECT_TRUE(told[0].contains("A step of the processing failed and was left out"))
            << qPrintable(told[0]);
        opened.click("chkBxAutoRefresh");
        countRuns();
        told = boxes([&] {
            block("sldrSaturation")->setValue(130);
            EXPECT_TRUE(QTest::qWaitFor([&] { return runs == 1; }, 3000));
        });
        EXPECT_EQ(told.size(), 0) << "it was told";
        QStringList asked;
        const ModalDialogs user([&asked](QDialog& dialog) {
            if (auto* box = qobject_cast<QMessageBox*>(&dialog)) {
                asked += box->text();
                box->button(asked.size() == 1 ? QMessageBox::No : QMessageBox::Yes)->click();
            }
        });
        block("sldrSaturation")->setValue(300);
        opened.click("btnOK");
        EXPECT_TRUE(asked.value(0).contains("was left out"));
        EXPECT_TRUE(opened.window.isVisible());
        block("sldrSaturation")->setValue(500);
        opened.click("btnOK");
        EXPECT_EQ(asked.size(), 2);
        EXPECT_FALSE(opened.window.isVisible());
        opened.window.reject();
    });
}

TEST_F(Runs, ThatFailLeaveTheWindowOpenAndCanBeMadeAnew) {
    opened.run([&] {
        opened.core()->setObserver([](const TaskReport&) { throw std::bad_alloc(); });
        const QStringList told = boxes([&] { opened.click("btnOK"); });
        EXPECT_EQ(told.size(), 1);
        EXPECT_TRUE(opened.window.isVisible());
        EXPECT_FALSE(opened.window.appliesOnFinish());
        opened.core()->setObserver({});
        countRuns();
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 1);
    expectWholeResult();
}

class RunsAndDrafts : public Runs {
protected:
    QGraphicsView* view() { return opened.window.findChildren<CSignaledGraphicsView*>().last(); }
    QRectF seen() { return view()->mapToScene(view()->viewport()->rect()).boundingRect(); }

    // What lies over the whole picture: a draft or a step.
    QRectF part() {
        for (const QGraphicsItem* item : view()->scene()->items())
            if (dynamic_cast<const CGridCell*>(item) && item->zValue() > 1)
                return item->sceneBoundingRect();
        return {};
    }
};

TEST_F(RunsAndDrafts, GoWithWhatIsSeenUntilThereIsAResult) {
    LogCapture log;
    opened.run([&] {
        const auto covered = [&] {
            return part().adjusted(-1, -1, 1, 1).contains(seen() & view()->sceneRect());
        };
        for (int i = 0; i < 4; ++i)
            opened.click("btnZoomIn");
        block("sldrSaturation")->setValue(130);
        EXPECT_TRUE(QTest::qWaitFor(covered, 3000));
        for (QScrollBar* bar : {view()->horizontalScrollBar(), view()->verticalScrollBar()})
            bar->setValue(bar->maximum());
        EXPECT_TRUE(QTest::qWaitFor(covered, 3000)) << "after scrolling";
        opened.click("btnZoomOut");
        opened.click("btnZoomOut");
        EXPECT_TRUE(QTest::qWaitFor(covered, 3000)) << "after zooming";
        EXPECT_FALSE(log.has("CWgtPaneAdvancedImpl::applyGUIParams")) << "the listing is one of runs";
        opened.core()->setObserver([](const TaskReport&) { throw std::bad_alloc(); });
        boxes([&] { opened.click("btnRefresh"); });
        EXPECT_TRUE(part().isNull()) << "a run that failed left a step over the picture before";
        opened.click("btnCancel");
    });
}

} // namespace
