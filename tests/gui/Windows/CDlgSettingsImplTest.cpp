#include "GUI/Windows/CDlgSettingsImpl.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "gui/Windows/RunsFixture.h"
#include "support/ModalDialog.h"

#include <QCloseEvent>
#include <QInputDialog>
#include <QLabel>
#include <QMessageBox>

using namespace orvela;

namespace {

using SettingsWindow = Runs;

TEST(CDlgSettingsImpl, EveryChangeOfASettingIsRefreshedByItself) {
    for (const EGUIMode mode : {Mode_Advanced, Mode_ColorFilter}) {
        SCOPED_TRACE(mode);
        ProcessingWindow opened(mode, testplanes::noise(72, 48));
        opened.run([&] {
            auto* block = opened.window.findChild<COrvelaSliderBlockImpl*>();
            auto* automatic = opened.find<QAbstractButton>("chkBxAutoRefresh");
            if (!automatic->isChecked())
                automatic->click();
            const std::function<void()> changes[] = {
                [&] { block->setEnabled(!block->isEnabled()); },
                [&] { block->sldrValue->moveTo(block->value() + 10); },
                [&] { opened.window.findChild<CColorPicker*>()->setColor(QColor(1, 2, 3)); },
                [&] { opened.presets()->setCurrentText(QStringLiteral("MacroPro")); },
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

TEST(CDlgSettingsImpl, APaneOpensWithThePresetThatItWasLeftWithAndNothingDone) {
    const auto expectNothingDone = [](ProcessingWindow& opened) {
        QTest::qWait(100);
        for (const QLabel* label : opened.window.findChildren<QLabel*>())
            EXPECT_FALSE(label->text() == "Draft" && label->isVisible());
        EXPECT_FALSE(opened.find("btnUndo")->isEnabled());
    };
    ProcessingWindow first(Mode_Advanced, testplanes::noise(72, 48));
    first.run([&] {
        EXPECT_EQ(first.presets()->currentText(), "Automatic");
        expectNothingDone(first);
        first.presets()->setCurrentText(QStringLiteral("Macro"));
        first.click("btnCancel");
    });
    for (const EGUIMode other : {Mode_Adjustments, Mode_FinalTouch, Mode_AutoLevels}) {
        ProcessingWindow between(other, testplanes::noise(72, 48));
        between.run([&] { other == Mode_AutoLevels ? void() : between.click("btnCancel"); });
    }
    ProcessingWindow again(Mode_FinalTouch, testplanes::noise(72, 48));
    again.run([&] {
        for (const char* way : {"btnBack", "btnFinalTouch", "btnBack"}) {
            SCOPED_TRACE(way);
            again.find<QAbstractButton>(way)->click();
            expectNothingDone(again);
            if (again.find("frmPresets")->isVisible()) {
                EXPECT_EQ(again.presets()->currentText(), "Macro");
            }
            again.click("btnRefresh");
            again.click("btnTurnAllOn");
            EXPECT_TRUE(again.find("btnUndo")->isEnabled());
        }
        again.click("btnCancel");
    });
}

TEST(CDlgSettingsImpl, HelpOpensThePageOfTheMode) {
    for (const auto& [mode, topic] : {std::pair(Mode_Adjustments, "adjustments.htm"),
                                      {Mode_AddIllumination, "illumination.htm"},
                                      {Mode_Advanced, "advancedenhancementoptions.htm"},
                                      {Mode_FinalTouch, "finaltouch.htm"},
                                      {Mode_SmartLevels, "allfilterfunctions.htm"},
                                      {Mode_SmartSharpness, "allfilterfunctions.htm"},
                                      {Mode_ColorFilter, "allfilterfunctions.htm"}}) {
        QString asked;
        ProcessingWindow opened(mode, testplanes::noise(8, 8));
        opened.window.setHelp([&asked](const QString& page) { asked += page; });
        opened.run([&] {
            opened.click("btnHelp");
            opened.click("btnCancel");
        });
        EXPECT_EQ(asked, topic);
    }
}

class Presets : public Runs {
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
                box->button(answer)->click();
            }
        });
        opened.click(button);
        return said;
    }
    double value() { return block()->value(); }
    void move(double position) { block()->sldrValue->moveTo(position); }
    void choose(const char* name) { opened.presets()->setCurrentText(QLatin1String(name)); }
    QString chosen() { return opened.presets()->currentText(); }
    bool listed(const QString& name) { return opened.presets()->findText(name) >= 0; }
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

        choose("Macro");
        move(800);
        press("btnSavePreset", QMessageBox::No, mine);
        EXPECT_EQ(chosen(), "Macro");
        press("btnSavePreset", QMessageBox::Yes, mine);
        EXPECT_EQ(chosen(), mine);
        move(100);
        press("btnRevertPreset", QMessageBox::No);
        EXPECT_EQ(value(), 100);
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

TEST_F(SettingsWindow, TabGoesThroughThePaneBeforeTheButtonsBelowIt) {
    opened.run([&] {
        for (const bool second : {false, true}) {
            QStringList order;
            for (QWidget* each = opened.find("btnDeletePreset"); each != opened.find("chkBxAutoRefresh");
                 each = each->nextInFocusChain()) {
                const bool ofPane = opened.find("frmCentralContainer")->isAncestorOf(each);
                const QString name = ofPane ? QStringLiteral("pane") : each->objectName();
                if (each->focusPolicy() & Qt::TabFocus && name.contains(QRegularExpression("^(btn|pane)")) &&
                    !order.endsWith(name))
                    order += name;
            }
            EXPECT_EQ(order.join(' ').toStdString(), "btnDeletePreset pane btnHelp btnOK btnCancel");
            if (!second) {
                opened.click("btnRefresh");
                opened.click("btnFinalTouch");
            }
        }
        opened.click("btnCancel");
    });
}

TEST_F(SettingsWindow, StaysOnTheScreenWhenItGrows) {
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

TEST_F(SettingsWindow, NamesEveryButtonAndListForWhoDoesNotSeeIt) {
    for (const auto* button : opened.window.findChildren<QToolButton*>())
        EXPECT_FALSE(button->accessibleName().isEmpty() && button->text().isEmpty())
            << qPrintable(button->objectName());
    EXPECT_FALSE(opened.presets()->accessibleName().isEmpty());
}

TEST(CDlgSettingsImpl, AllOnLeavesOffWhatIsNeverShown) {
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(72, 48));
    opened.run([&] {
        COrvelaSliderBlockImpl* hidden = opened.block("sldrAutoContrast");
        hidden->setEnabled(false);
        opened.click("btnTurnAllOn");
        EXPECT_FALSE(hidden->isEnabled());
        EXPECT_TRUE(opened.block("sldrGamma_Abs")->isEnabled()) << "of a hidden group";
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
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(72, 48));
    QCoreApplication::postEvent(&opened.window, new QCloseEvent);
    opened.window.run();
    EXPECT_TRUE(openSettings().value(split).toBool());
    EXPECT_EQ(openSettings().value(selected).toString(), "Macro");
}

} // namespace
