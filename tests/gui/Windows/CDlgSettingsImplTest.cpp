#include "GUI/Windows/CDlgSettingsImpl.h"

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Windows/CDlgSinglePreviewImpl.h"
#include "Settings/ModeTable.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/BoxAnswer.h"
#include "support/ModalDialog.h"

#include <QComboBox>
#include <QInputDialog>
#include <QLabel>
#include <QScrollBar>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

std::unique_ptr<CARGBPlane> picture() {
    return testplanes::make(96, 64, [](int x, int y) {
        return testplanes::Pixel{std::uint8_t(40 + x), std::uint8_t(30 + x + y), std::uint8_t(20 + 2 * y)};
    });
}

TEST(CDlgSettingsImpl, EveryAutomaticModeAppliesWhatTheEngineMakes) {
    for (const ModeDescription& mode : ModeTable::all()) {
        if (!CPresetStore::isFactoryMode(mode.mode))
            continue;
        SCOPED_TRACE(mode.displayName);
        ProcessingWindow opened(mode.mode, picture());
        opened.run();
        EXPECT_TRUE(opened.window.appliesOnFinish());
        EXPECT_EQ(opened.window.result(), QDialog::Accepted);
        EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(mode.mode)));
    }
}

TEST(CDlgSettingsImpl, ASingleFilterAppliesWhatItsSliderSays) {
    for (const EGUIMode mode :
         {Mode_SmartSharpness, Mode_AddDigitalFlash, Mode_Temperature, Mode_SmartGamma}) {
        SCOPED_TRACE(mode);
        ProcessingWindow opened(mode, picture());
        double position = 0;
        opened.run([&] {
            auto* slider = opened.find<COrvelaSliderBlockImpl>("sldrGeneric");
            slider->txtValue->setText(SliderScales::textOf(slider->value() > 500 ? 1.0 : 3000.0));
            position = slider->exactValue();
            opened.click("btnOK");
        });
        CUserParamsPhotoshop params(mode);
        params.mSliderParams.*params.mGenericSlider.field = static_cast<float>(position);
        EXPECT_TRUE(opened.window.appliesOnFinish());
        EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(params));
    }
}

TEST(CDlgSettingsImpl, OkAfterARefreshAcceptsWithoutAnotherRun) {
    ProcessingWindow opened(Mode_Advanced, picture());
    int runs = 0;
    opened.run([&] {
        QObject::connect(opened.core(), &CThreadedCore::started, [&runs] { ++runs; });
        opened.click("btnRefresh");
        EXPECT_EQ(opened.window.windowTitle(), "Advanced");
        opened.click("btnOK");
    });
    EXPECT_TRUE(opened.window.appliesOnFinish());
    EXPECT_EQ(runs, 1);
}

TEST(CDlgSettingsImpl, AStoppedRunIsNotTakenForTheResult) {
    ProcessingWindow opened(Mode_Advanced, picture());
    int runs = 0;
    opened.run([&] {
        QObject::connect(opened.core(), &CThreadedCore::started, [&runs] { ++runs; });
        const auto stop =
            QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window,
                             [&](int step) { step == 3 ? opened.click("btnStopProcessing") : void(); });
        opened.click("btnRefresh");
        QObject::disconnect(stop);
        EXPECT_TRUE(opened.find("btnRefresh")->isVisible());
        opened.click("btnOK");
    });
    EXPECT_EQ(runs, 2);
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(Mode_Automatic)));
}

TEST(CDlgSettingsImpl, CancelInTheMiddleOfARunAppliesNothing) {
    ProcessingWindow opened(Mode_Advanced, picture());
    bool hidden = false;
    opened.run([&] {
        QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [&](int step) {
            if (step != 5)
                return;
            opened.click("btnCancel");
            hidden = !opened.window.isVisible(); // at once
        });
        opened.click("btnRefresh");
    });
    EXPECT_TRUE(hidden);
    EXPECT_FALSE(opened.window.appliesOnFinish());
    EXPECT_EQ(opened.window.result(), QDialog::Rejected);
}

TEST(CDlgSettingsImpl, OkInTheMiddleOfARunStartsItAnewAndAcceptsTheWholeOne) {
    ProcessingWindow opened(Mode_Advanced, picture());
    QStringList heard;
    bool pressed = false; // outlives the user's hand: the second run comes after it
    opened.run([&] {
        QObject::connect(opened.core(), &CThreadedCore::started, [&] { heard += QStringLiteral("started"); });
        QObject::connect(opened.core(), &CThreadedCore::finished,
                         [&] { heard += QStringLiteral("finished"); });
        QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [&](int step) {
            if (step == 4 && !std::exchange(pressed, true))
                opened.click("btnOK");
        });
        opened.click("btnRefresh");
    });
    EXPECT_EQ(heard.join(' '), "started finished started finished");
    EXPECT_TRUE(opened.window.appliesOnFinish());
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(Mode_Automatic)));
}

TEST(CDlgSettingsImpl, WhatIsChosenDuringARunIsWhatOkApplies) {
    for (const char* button : {"btnRefresh", "btnOK"}) {
        SCOPED_TRACE(button);
        ProcessingWindow opened(Mode_Advanced, picture());
        bool chosen = false;
        opened.run([&] {
            QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [&](int step) {
                if (step == 6 && !std::exchange(chosen, true))
                    opened.find<QComboBox>("lstBxPreset")->setCurrentText(QStringLiteral("Landscape"));
            });
            opened.click(button);
            if (opened.window.isVisible() && opened.find("btnOK")->isEnabled())
                opened.click("btnOK");
        });
        EXPECT_TRUE(opened.window.appliesOnFinish());
        EXPECT_EQ(testplanes::bytes(opened.output),
                  opened.engineResult(CUserParamsPhotoshop(Mode_Landscape)));
    }
}

TEST(CDlgSettingsImpl, ThreeChangesWithinASecondMakeOneRun) {
    ProcessingWindow opened(Mode_Advanced, picture());
    int runs = 0;
    opened.run([&] {
        QObject::connect(opened.core(), &CThreadedCore::started, [&runs] { ++runs; });
        opened.click("chkBxAutoRefresh");
        for (const double position : {200.0, 400.0, 600.0}) {
            opened.find<COrvelaSliderBlockImpl>("sldrSaturation")->sldrValue->moveTo(position);
            QTest::qWait(100);
            EXPECT_EQ(runs, 0);
        }
        EXPECT_TRUE(QTest::qWaitFor([&] { return runs > 0; }, 5000));
        QTest::qWait(1500);
        opened.click("btnCancel");
    });
    EXPECT_EQ(runs, 1);
}

TEST(CDlgSettingsImpl, FinalTouchGoesOnFromTheResultAndComesBackToThePreset) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        auto* presets = opened.find<QComboBox>("lstBxPreset");
        presets->setCurrentText(QStringLiteral("Landscape"));
        opened.click("btnRefresh");
        const std::vector<std::uint8_t> landscape = testplanes::bytes(opened.output);
        opened.click("btnFinalTouch");
        EXPECT_EQ(opened.window.windowTitle(), "Final Touch");
        EXPECT_FALSE(opened.find("frmPresets")->isVisible());
        EXPECT_TRUE(opened.find<QAbstractButton>("chkBxAutoRefresh")->isChecked());
        EXPECT_EQ(testplanes::bytes(*opened.input), landscape);
        EXPECT_TRUE(QTest::qWaitFor([&] { return opened.find("btnBack")->isEnabled(); }, 5000));
        opened.click("btnBack");
        EXPECT_EQ(presets->currentText(), "Landscape");
        EXPECT_EQ(testplanes::bytes(*opened.input), testplanes::bytes(opened.proxy.plane()));
        opened.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, PresetsAreSavedOverwrittenRevertedAndDeleted) {
    ProcessingWindow opened(Mode_Adjustments, picture());
    opened.run([&] {
        EXPECT_FALSE(opened.find("frmPresets")->isVisible());
        opened.click("btnCancel");
    });
    ProcessingWindow advanced(Mode_Advanced, picture());
    advanced.run([&] {
        auto* presets = advanced.find<QComboBox>("lstBxPreset");
        auto* saturation = advanced.find<COrvelaSliderBlockImpl>("sldrSaturation");
        const auto named = [](const QString& name) {
            return [name](QDialog& dialog) {
                if (auto* input = qobject_cast<QInputDialog*>(&dialog)) {
                    EXPECT_EQ(input->windowTitle(), "Save Preset");
                    input->setTextValue(name);
                    return input->accept();
                }
            };
        };
        {
            const ModalDialogs hand(named(QStringLiteral("Mine")));
            saturation->sldrValue->moveTo(300);
            advanced.click("btnSavePreset");
        }
        EXPECT_EQ(presets->currentText(), "Mine");
        saturation->sldrValue->moveTo(800);
        QString said;
        answerBox(QMessageBox::Yes, said);
        advanced.click("btnRevertPreset");
        EXPECT_EQ(said.section('|', 0, 0), "Warning");
        EXPECT_EQ(saturation->value(), 300);
        answerBox(QMessageBox::Yes, said);
        advanced.click("btnDeletePreset");
        EXPECT_EQ(presets->findText(QStringLiteral("Mine")), -1);
        presets->setCurrentText(QStringLiteral("Macro"));
        answerBox(QMessageBox::Ok, said);
        advanced.click("btnDeletePreset");
        EXPECT_EQ(said,
                  "Warning|The current preset cannot be deleted, since it's one of the factory presets.");
        EXPECT_EQ(presets->currentText(), "Macro");
        advanced.click("btnCancel");
    });
    EXPECT_FALSE(CPresetStore::presetExists(Mode_Advanced, QStringLiteral("Mine")));
}

TEST(CDlgSettingsImpl, SplitPreviewsAreFoundAgainWhereTheyWere) {
    const QRect place(60, 70, 300, 240);
    {
        ProcessingWindow opened(Mode_Advanced, picture());
        opened.run([&] {
            opened.click("btnSplitPreviews");
            EXPECT_FALSE(opened.find("CDlgDualPreview")->isVisible());
            for (auto* single : opened.window.findChildren<CDlgSinglePreviewImpl*>())
                EXPECT_TRUE(single->isVisible());
            opened.window.findChildren<CDlgSinglePreviewImpl*>().first()->setGeometry(place);
            opened.click("btnCancel");
        });
    }
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        const auto* first = opened.window.findChildren<CDlgSinglePreviewImpl*>().first();
        EXPECT_TRUE(first->isVisible());
        EXPECT_EQ(first->geometry(), place);
        opened.click("btnGluePreviews");
        EXPECT_TRUE(opened.find("CDlgDualPreview")->isVisible());
        opened.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, ZoomsByItsTableAndBothViewsKeepTogether) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        const auto views = opened.window.findChildren<CSignaledGraphicsView*>();
        ASSERT_EQ(views.size(), 2);
        auto* label = opened.find<QLabel>("lblZoomLevel");
        const double fitted = views[0]->transform().m11();
        EXPECT_NEAR(fitted * 96, views[0]->width(), 1);
        for (int i = 0; i < 20; ++i)
            opened.click("btnZoomIn");
        EXPECT_EQ(label->text(), "5000%");
        EXPECT_NEAR(views[1]->transform().m11(), 50 * fitted, 1e-3);
        views[0]->horizontalScrollBar()->setValue(500);
        Q_EMIT views[0]->scrolledBy(500, 40);
        EXPECT_EQ(views[1]->horizontalScrollBar()->value(), 500);
        for (int i = 0; i < 40; ++i)
            opened.click("btnZoomOut");
        EXPECT_EQ(label->text(), "1%");
        opened.find("CDlgDualPreview")->resize(900, 500);
        QTest::qWait(50);
        EXPECT_EQ(label->text(), "1%");
        EXPECT_NEAR(views[0]->transform().m11() * 96, views[0]->width(), 1) << "fitted anew";
        opened.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, TabGoesThroughThePaneBeforeTheButtonsBelowIt) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        for (const bool second : {false, true}) {
            QStringList order;
            QWidget* each = opened.find("chkBxAutoRefresh");
            for (int i = 0; i < 400 && !order.contains(each->objectName()); ++i) {
                if (each->focusPolicy() & Qt::TabFocus && !each->objectName().isEmpty() &&
                    opened.window.isAncestorOf(each) && each->parent()->parent() == &opened.window)
                    order += each->objectName();
                if (opened.find("frmCentralContainer")->isAncestorOf(each) && !order.endsWith("pane"))
                    order += QStringLiteral("pane");
                each = each->nextInFocusChain();
            }
            EXPECT_EQ(order.mid(order.indexOf("btnDeletePreset")).join(' ').toStdString(),
                      "btnDeletePreset pane btnHelp btnOK btnCancel");
            if (!second) {
                opened.click("btnRefresh");
                opened.click("btnFinalTouch");
            }
        }
        opened.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, NamesEveryButtonAndListForWhoDoesNotSeeIt) {
    const ProcessingWindow opened(Mode_Advanced, picture());
    for (const auto* button : opened.window.findChildren<QToolButton*>())
        EXPECT_FALSE(button->accessibleName().isEmpty() && button->text().isEmpty())
            << qPrintable(button->objectName());
    EXPECT_FALSE(opened.window.findChild<QComboBox*>("lstBxPreset")->accessibleName().isEmpty());
}

TEST(CDlgSettingsImpl, AllOnLeavesOffWhatIsNeverShown) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        auto* hidden = opened.find<COrvelaSliderBlockImpl>("sldrAutoContrast");
        hidden->setEnabled(false);
        opened.click("btnTurnAllOn");
        EXPECT_FALSE(hidden->isEnabled());
        EXPECT_TRUE(opened.find<COrvelaSliderBlockImpl>("sldrGamma_Abs")->isEnabled()) << "of a hidden group";
        hidden->setEnabled(true);
        opened.click("btnTurnAllOff");
        EXPECT_FALSE(hidden->isEnabled());
        opened.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, KeepsWhatIsStoredWhenItWasClosedBeforeItCameToStandThere) {
    const QString split = QStringLiteral("2000/GUI/CDlgSettingsImpl/previewsSplitted");
    const QString selected = QStringLiteral("2000/GUI/CDlgSettingsImpl/selectedPreset");
    openSettings().setValue(split, true);
    openSettings().setValue(selected, QStringLiteral("Macro"));
    ProcessingWindow opened(Mode_Advanced, picture());
    QTimer::singleShot(0, &opened.window, [&opened] { opened.window.reject(); });
    opened.window.run();
    EXPECT_TRUE(openSettings().value(split).toBool());
    EXPECT_EQ(openSettings().value(selected).toString(), "Macro");
    openSettings().clear();
}

TEST(CDlgSettingsImpl, AViewThatBecomesLowerReachesTheWholePicture) {
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(64, 96));
    opened.run([&] {
        auto* joined = opened.find("CDlgDualPreview");
        auto* view = opened.window.findChildren<CSignaledGraphicsView*>().last();
        joined->resize(800, 700);
        QTest::qWait(50);
        const auto bottom = [view] {
            view->verticalScrollBar()->setValue(view->verticalScrollBar()->maximum());
            return view->mapToScene(QPoint(0, view->viewport()->height())).y();
        };
        EXPECT_NEAR(bottom(), 96, 1);
        joined->resize(800, 500);
        QTest::qWait(50);
        EXPECT_NEAR(bottom(), 96, 1);
        opened.click("btnCancel");
    });
}

} // namespace
