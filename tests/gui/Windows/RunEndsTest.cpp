// What the runs of the processing window leave behind: the keyboard's place, what the next pane begins with,
// what is told of failures, and what the previews show.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Preview/CGridCell.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "gui/Windows/RunsFixture.h"
#include "support/LogCapture.h"
#include "support/ModalDialog.h"

#include <QCheckBox>
#include <QMessageBox>
#include <QPushButton>
#include <QScrollBar>

using namespace orvela;

namespace {

using RunEnds = Runs;

TEST_F(RunEnds, GiveTheKeyboardBackToWhereItWas) {
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

TEST_F(RunEnds, OfTheNextPaneFollowTheResultsOfTheOneBefore) {
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
        runs = 0;
        countRuns();
        opened.click("btnFinalTouch");
        EXPECT_EQ(runs, 1) << "it goes on from the result of the sliders";
        EXPECT_EQ(opened.window.windowTitle(), "Final Touch");
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

// Builds with assertions end where a filter meets such a proxy.
#if defined(QT_NO_DEBUG) && !defined(QT_FORCE_ASSERTS)
// A proxy that the filters which look at the host's picture cannot use.
struct UselessProxy final : CARGBPlaneProxy {
    void getPixels(int, int, int, int, void*, int) override {}
};

TEST_F(RunEnds, TellOnceOfAStepThatFailedAndAskBeforeItsPictureIsUsed) {
    UselessProxy useless;
    const auto breakFlash = [&] {
        block("sldrDigitalFlash")->setEnabled(true);
        opened.core()->setProxy(&useless);
    };
    opened.run([&] {
        breakFlash();
        QStringList told = messageBoxes([&] { opened.click("btnRefresh"); });
        ASSERT_EQ(told.size(), 1);
        EXPECT_TRUE(told[0].contains("A step of the processing failed and was left out") &&
                    told[0].endsWith("(Brightness limit)"))
            << qPrintable(told[0]);
        opened.click("chkBxAutoRefresh");
        countRuns();
        told = messageBoxes([&] {
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
        opened.click("btnOK");
        EXPECT_EQ(asked.size(), 2) << "the answer holds for once";
        EXPECT_FALSE(opened.window.isVisible());
        opened.window.reject();
    });
}
#endif

TEST_F(RunEnds, ThatFailLeaveTheWindowOpenAndCanBeMadeAnew) {
    opened.run([&] {
        opened.core()->setObserver([](const TaskReport&) { throw std::bad_alloc(); });
        const QStringList told = messageBoxes([&] { opened.click("btnOK"); });
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
        messageBoxes([&] { opened.click("btnRefresh"); });
        EXPECT_TRUE(part().isNull()) << "a run that failed left a step over the picture before";
        opened.click("btnCancel");
    });
}

} // namespace
