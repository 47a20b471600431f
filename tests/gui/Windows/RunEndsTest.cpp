// What the runs of the processing window leave behind: the keyboard's place, what the next pane begins with,
// what is told of failures, and what the previews show.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Preview/CGridCell.h"
#include "gui/Windows/RunsFixture.h"
#include "support/LogCapture.h"
#include "support/ModalDialog.h"

#include <QMessageBox>
#include <QScrollBar>

using namespace orvela;

namespace {

class RunEnds : public Runs {
protected:
    // What lies over the whole picture: a draft or a step.
    QRectF part() {
        for (const QGraphicsItem* item : opened.views()[1]->scene()->items())
            if (dynamic_cast<const CGridCell*>(item) && item->zValue() > 1)
                return item->sceneBoundingRect();
        return {};
    }
};

TEST_F(RunEnds, GiveTheKeyboardBackToWhereItWas) {
    opened.run([&] {
        opened.window.activateWindow();
        opened.click("chkBxAutoRefresh");
        QWidget* slider = block()->sldrValue;
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

        block()->setValue(130);
        opened.find("btnOK")->setFocus();
        during([&] { QTest::keyClick(opened.window.focusWidget(), Qt::Key_Space); }); // twice, by mistake
        QTest::keyClick(opened.find("btnOK"), Qt::Key_Space);
    });
    expectWholeResult();
}

TEST_F(RunEnds, OfTheNextPaneFollowTheResultsOfTheOneBefore) {
    opened.run([&] {
        const auto goBack = [&] {
            EXPECT_TRUE(QTest::qWaitFor([&] { return opened.find("btnBack")->isEnabled(); }, 3000));
            opened.click("btnBack");
        };
        auto* automatic = opened.find<QAbstractButton>("chkBxAutoRefresh");
        opened.presets()->setCurrentText(QStringLiteral("Landscape"));
        opened.click("btnRefresh");
        const std::vector<std::uint8_t> landscape = testplanes::bytes(opened.output);
        opened.click("btnFinalTouch");
        EXPECT_FALSE(opened.find("frmPresets")->isVisible() || opened.find("btnRefresh")->isVisible());
        EXPECT_TRUE(automatic->isChecked());
        EXPECT_TRUE(testplanes::bytes(*opened.input) == landscape);
        countRuns();
        EXPECT_TRUE(QTest::qWaitFor([&] { return runs == 1; }, 3000));
        goBack();
        EXPECT_EQ(opened.presets()->currentText(), "Landscape");
        EXPECT_TRUE(testplanes::bytes(*opened.input) == testplanes::bytes(opened.proxy.plane()));
        EXPECT_FALSE(automatic->isChecked());
        EXPECT_TRUE(opened.find("btnRefresh")->isVisible()) << "or nothing would be processed any more";

        opened.click("btnRefresh");
        block()->setValue(130);
        runs = 0;
        countRuns();
        opened.click("chkBxAutoRefresh");
        opened.click("btnFinalTouch");
        EXPECT_EQ(runs, 1) << "it goes on from the result of the sliders";
        goBack();
        EXPECT_TRUE(automatic->isChecked());
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
            block()->setValue(130);
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
        block()->setValue(300);
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
        EXPECT_TRUE(part().isNull()) << "a step of it lies over the picture before";
        EXPECT_TRUE(opened.window.isVisible());
        EXPECT_FALSE(opened.window.appliesOnFinish());
        opened.core()->setObserver({});
        countRuns();
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 1);
    expectWholeResult();
}

TEST_F(RunEnds, AreLookedForwardToByDraftsOfWhatIsSeen) {
    LogCapture log;
    opened.run([&] {
        const QGraphicsView* view = opened.views()[1];
        const auto covered = [&] {
            const QRectF seen = view->mapToScene(view->viewport()->rect()).boundingRect();
            return part().adjusted(-1, -1, 1, 1).contains(seen & view->sceneRect());
        };
        for (int i = 0; i < 4; ++i)
            opened.click("btnZoomIn");
        block()->setValue(130);
        EXPECT_TRUE(QTest::qWaitFor(covered, 3000));
        for (QScrollBar* bar : {view->horizontalScrollBar(), view->verticalScrollBar()})
            bar->setValue(bar->maximum());
        EXPECT_TRUE(QTest::qWaitFor(covered, 3000)) << "after scrolling";
        opened.click("btnZoomOut");
        opened.click("btnZoomOut");
        EXPECT_TRUE(QTest::qWaitFor(covered, 3000)) << "after zooming";
        EXPECT_FALSE(log.has("CWgtPaneAdvancedImpl::applyGUIParams")) << "the listing is one of runs";
        opened.click("btnCancel");
    });
}

} // namespace
