#include "GUI/Windows/CDlgSettingsImpl.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Windows/CDlgSinglePreviewImpl.h"
#include "GUI/Windows/HelpPages.h"
#include "Settings/ModeTable.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/ModalDialog.h"

#include <QComboBox>
#include <QInputDialog>
#include <QLabel>
#include <QMessageBox>
#include <QScrollBar>

#include <gtest/gtest.h>

#include <map>

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

TEST(CDlgSettingsImpl, EveryChangeOfASettingIsRefreshedByItself) {
    for (const EGUIMode mode : {Mode_Advanced, Mode_ColorFilter}) {
        SCOPED_TRACE(mode);
        ProcessingWindow opened(mode, picture());
        opened.run([&] {
            auto* block = opened.window.findChildren<COrvelaSliderBlockImpl*>().first();
            auto* automatic = opened.find<QAbstractButton>("chkBxAutoRefresh");
            if (!automatic->isChecked())
                automatic->click();
            const std::function<void()> changes[] = {
                [&] { block->setEnabled(!block->isEnabled()); },
                [&] { block->sldrValue->moveTo(block->value() + 10); },
                [&] { opened.window.findChild<CColorPicker*>()->setColor(QColor(1, 2, 3)); },
                [&] { opened.find<QComboBox>("lstBxPreset")->setCurrentText(QStringLiteral("MacroPro")); },
                [&] { QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier); },
            };
            for (std::size_t i = 0; i < std::size(changes); ++i) {
                opened.letTheSecondPass();
                EXPECT_FALSE(opened.refreshTimer()->isActive());
                changes[i]();
                EXPECT_TRUE(opened.refreshTimer()->isActive() || (i == 3 && mode != Mode_Advanced)) << i;
            }
            opened.click("btnCancel");
        });
    }
}

TEST(CDlgSettingsImpl, AdvancedOpensWithThePresetThatItWasLeftWithAndNothingDone) {
    const auto expectNothingDone = [](ProcessingWindow& opened) {
        QTest::qWait(100);
        for (const QLabel* label : opened.window.findChildren<QLabel*>())
            EXPECT_FALSE(label->text() == "Draft" && label->isVisible());
        EXPECT_FALSE(opened.find("btnUndo")->isEnabled());
    };
    ProcessingWindow first(Mode_Advanced, picture());
    first.run([&] {
        EXPECT_EQ(first.find<QComboBox>("lstBxPreset")->currentText(), "Automatic");
        expectNothingDone(first);
        first.find<QComboBox>("lstBxPreset")->setCurrentText(QStringLiteral("Macro"));
        first.click("btnCancel");
    });
    for (const EGUIMode other : {Mode_Adjustments, Mode_FinalTouch, Mode_AutoLevels}) {
        ProcessingWindow between(other, picture());
        between.run([&] { other == Mode_AutoLevels ? void() : between.click("btnCancel"); });
    }
    ProcessingWindow again(Mode_FinalTouch, picture());
    again.run([&] {
        for (const char* way : {"btnBack", "btnFinalTouch", "btnBack"}) {
            SCOPED_TRACE(way);
            again.find<QAbstractButton>(way)->click();
            expectNothingDone(again);
            if (again.find("frmPresets")->isVisible()) {
                EXPECT_EQ(again.find<QComboBox>("lstBxPreset")->currentText(), "Macro");
            }
            again.click("btnRefresh");
        }
        again.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, HelpOpensThePageOfTheMode) {
    std::map<EGUIMode, QString> topics = {{Mode_Adjustments, QStringLiteral("adjustments.htm")},
                                          {Mode_AddIllumination, QStringLiteral("illumination.htm")},
                                          {Mode_Advanced, QStringLiteral("advancedenhancementoptions.htm")},
                                          {Mode_FinalTouch, QStringLiteral("finaltouch.htm")},
                                          {Mode_SmartLevels, QStringLiteral("allfilterfunctions.htm")}};
    for (int filter = Mode_SmartSharpness; filter <= Mode_ColorFilter; ++filter)
        topics.emplace(EGUIMode(filter), QStringLiteral("allfilterfunctions.htm"));
    EXPECT_EQ(topics.size(), 18U);
    for (const auto& [mode, topic] : topics) {
        QString asked;
        ProcessingWindow opened(mode, testplanes::noise(8, 8));
        opened.window.setHelp([&asked](const QString& page) { asked += page; });
        opened.run([&] {
            opened.click("btnHelp");
            opened.click("btnCancel");
        });
        EXPECT_EQ(asked, topic) << mode;
        EXPECT_EQ(HelpPages::pageOf(asked).fileName(), topic) << "in the manual";
    }
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

class Presets : public testing::Test {
protected:
    // What the boxes say that the button brings; each is answered so.
    QStringList press(const char* button, QMessageBox::StandardButton answer, const QString& name = {}) {
        QStringList said;
        const ModalDialogs user([&](QDialog& dialog) {
            if (auto* input = qobject_cast<QInputDialog*>(&dialog)) {
                EXPECT_EQ(input->windowTitle(), "Save Preset");
                input->setTextValue(name);
                input->accept();
            } else if (auto* box = qobject_cast<QMessageBox*>(&dialog)) {
                said += box->text();
                box->button(answer) ? box->button(answer)->click() : box->reject();
            }
        });
        opened.click(button);
        return said;
    }
    double value() { return saturation()->value(); }
    void move(double position) { saturation()->sldrValue->moveTo(position); }
    void choose(const char* name) { list()->setCurrentText(QLatin1String(name)); }
    QString chosen() { return list()->currentText(); }
    bool listed(const QString& name) { return list()->findText(name) >= 0; }

    ProcessingWindow opened{Mode_Advanced, picture()};

private:
    COrvelaSliderBlockImpl* saturation() { return opened.find<COrvelaSliderBlockImpl>("sldrSaturation"); }
    QComboBox* list() { return opened.find<QComboBox>("lstBxPreset"); }
};

TEST_F(Presets, AreSavedOverwrittenRevertedAndDeletedAsTheAnswersSay) {
    const QStringList asksToDelete("Are you sure you want to delete the selected preset?");
    const QString mine = QStringLiteral("Mine");
    opened.run([&] {
        move(300);
        EXPECT_EQ(press("btnSavePreset", QMessageBox::NoButton, mine), QStringList());
        EXPECT_EQ(chosen(), mine);
        EXPECT_EQ(press("btnSavePreset", QMessageBox::Ok, CPresetStore::batchPresetName()),
                  QStringList("This name is kept for the last operation. Choose another one."));
        EXPECT_FALSE(listed(CPresetStore::batchPresetName()));

        move(700);
        EXPECT_EQ(press("btnSavePreset", QMessageBox::No, mine).size(), 1);
        EXPECT_EQ(press("btnRevertPreset", QMessageBox::No).size(), 1);
        EXPECT_EQ(value(), 700);
        press("btnRevertPreset", QMessageBox::Yes);
        EXPECT_EQ(value(), 300) << "it was not written over";
        choose("Macro");
        move(800);
        press("btnSavePreset", QMessageBox::Yes, mine);
        EXPECT_EQ(chosen(), mine);
        move(100);
        press("btnRevertPreset", QMessageBox::Yes);
        EXPECT_EQ(value(), 800);

        EXPECT_EQ(press("btnDeletePreset", QMessageBox::No), asksToDelete);
        EXPECT_TRUE(listed(mine) && CPresetStore::presetExists(Mode_Advanced, mine));
        EXPECT_EQ(press("btnDeletePreset", QMessageBox::Yes), asksToDelete);
        EXPECT_FALSE(listed(mine) || CPresetStore::presetExists(Mode_Advanced, mine));
        opened.click("btnCancel");
    });
}

TEST_F(Presets, OfTheFactoryCanBeWrittenOverAndRevertedButNotDeleted) {
    opened.run([&] {
        choose("Macro");
        const double factory = value();
        move(800);
        press("btnSavePreset", QMessageBox::Yes, QStringLiteral("Macro"));
        const auto comesBack = [&] {
            choose("Portrait");
            choose("Macro");
            return value();
        };
        EXPECT_EQ(comesBack(), 800);
        press("btnRevertPreset", QMessageBox::No);
        EXPECT_EQ(comesBack(), 800);
        press("btnRevertPreset", QMessageBox::Yes);
        EXPECT_EQ(value(), factory);
        EXPECT_EQ(comesBack(), factory);
        EXPECT_EQ(
            press("btnDeletePreset", QMessageBox::Ok),
            QStringList("The current preset cannot be deleted, since it's one of the factory presets."));
        EXPECT_EQ(chosen(), "Macro");
        opened.click("btnCancel");
    });
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

TEST(CDlgSettingsImpl, ZoomsByItsTable) {
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

TEST(CDlgSettingsImpl, StaysOnTheScreenWhenItGrows) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        const QRect screen = opened.window.screen()->availableGeometry();
        const int folded = opened.window.height();
        opened.window.move(screen.left() + 5, screen.bottom() - opened.window.frameGeometry().height());
        opened.click("btnExtendSettings");
        EXPECT_TRUE(QTest::qWaitFor([&] { return opened.window.height() > folded; }));
        EXPECT_TRUE(QTest::qWaitFor([&] { return screen.contains(opened.window.frameGeometry()); }));
        EXPECT_TRUE(opened.find("btnOK")->visibleRegion().boundingRect() == opened.find("btnOK")->rect());
        opened.click("btnCollapseSettings");
        EXPECT_TRUE(QTest::qWaitFor([&] { return opened.window.height() == folded; }));
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
