#include "GUI/Windows/CDlgMainImpl.h"

#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CBatchMode.h"
#include "Platform/Keyboard.h"
#include "Settings/FactoryPresets.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/BoxAnswer.h"
#include "support/EnvironmentVariable.h"
#include "support/ModalDialog.h"

#include <QDir>
#include <QLabel>
#include <QMenu>
#include <QPointer>

#include <gtest/gtest.h>

#include <algorithm>

using namespace orvela;

namespace {

class CDlgMainImplTest : public testing::Test {
protected:
    CDlgMainImplTest() { reopen(); }

    bool run(const std::function<void()>& user) {
        QTimer::singleShot(0, &*mWindow, user);
        return mWindow->run();
    }

    QToolButton* button(const char* name) { return mWindow->findChild<QToolButton*>(QLatin1String(name)); }
    void click(const char* name) { QTest::mouseClick(button(name), Qt::LeftButton); }
    void reopen() {
        mWindow.reset();
        for (CARGBPlane* plane : {mInput.get(), &mOutput})
            plane->copyFrom(mProxy.plane());
        mWindow.emplace(nullptr, mInput.get(), &mOutput);
    }
    bool isBlank() const { return testplanes::bytes(mOutput) == testplanes::bytes(mProxy.plane()); }

    static QWidget* help() {
        for (QWidget* window : QApplication::topLevelWidgets())
            if (window->objectName() == QLatin1String("HelpWindow") && window->isVisible())
                return window;
        return nullptr;
    }

    // "the mode of the pane:title" of each window that the user's clicks open, and which is cancelled.
    std::string opens(const std::function<void()>& user) {
        QStringList opened;
        const ModalDialogs hand([&](QDialog& dialog) {
            if (&dialog == &*mWindow)
                return;
            const auto* pane = dialog.findChild<IWgtPane*>();
            opened += QStringLiteral("%1:%2").arg(pane ? pane->mode() : -1).arg(dialog.windowTitle());
            dialog.reject();
        });
        EXPECT_FALSE(run([&] {
            user();
            mWindow->close();
        }));
        return opened.join(QLatin1Char('|')).toStdString();
    }

    std::unique_ptr<CARGBPlane> mInput = testplanes::noise(64, 48);
    CARGBPlane mOutput{*mInput, QStringLiteral("output")};
    CARGBPlaneProxyDirect mProxy{*mInput};
    std::optional<CDlgMainImpl> mWindow;
};

TEST_F(CDlgMainImplTest, StartsCollapsedAndComesBackAsItWasLeft) {
    EXPECT_EQ(mWindow->windowTitle(), "Orvela 2");
    EXPECT_TRUE(mWindow->findChild<QLabel*>("updateAvailableLabel")->isHidden());
    EXPECT_FALSE(run([&] {
        EXPECT_EQ(button("btnAdvanced")->width(), 26);
        EXPECT_EQ(button("btnAdvanced")->text(), "");
        click("btnExpand");
        EXPECT_EQ(button("btnAdvanced")->width(), 124);
        EXPECT_EQ(button("btnCustomPresets")->text(), "Custom");
        EXPECT_EQ(button("btnToggleBatchMode")->text(), "Batch Mode is off");
        mWindow->move(30, 40);
        mWindow->close();
    }));
    reopen();
    EXPECT_EQ(button("btnIndivFilters")->text(), "All Filters");
    EXPECT_EQ(mWindow->pos(), QPoint(30, 40));
}

TEST_F(CDlgMainImplTest, AModeThatIsAppliedClosesItAndACancelledOneDoesNot) {
    bool backAgain = false;
    {
        const ModalDialogs hand([&](QDialog& dialog) {
            if (dialog.objectName() == QLatin1String("CDlgSettings"))
                QTest::mouseClick(dialog.findChild<QToolButton*>("btnCancel"), Qt::LeftButton);
        });
        EXPECT_TRUE(run([&] {
            click("btnAdvanced");
            backAgain = mWindow->isVisible() && mWindow->isEnabled();
            click("btnAutomatic");
        }));
    }
    EXPECT_TRUE(backAgain);
    EXPECT_FALSE(isBlank());
}

TEST_F(CDlgMainImplTest, EveryAutomaticButtonAppliesItsMode) {
    std::vector<std::vector<std::uint8_t>> pictures;
    for (const auto& [name, mode] : {std::pair("btnAutomatic", Mode_Automatic),
                                     {"btnAutoContrast", Mode_AutoContrast},
                                     {"btnAutoLevels", Mode_AutoLevels},
                                     {"btnAutoColor", Mode_AutoColor},
                                     {"btnAutoSaturation", Mode_AutoSaturation}}) {
        SCOPED_TRACE(name);
        reopen();
        EXPECT_TRUE(run([&, name = name] { click(name); }));
        const std::vector<std::uint8_t> picture = testplanes::bytes(mOutput);
        EXPECT_TRUE(picture == engineResult(CUserParamsPhotoshop(mode), mProxy.plane(), mProxy));
        EXPECT_EQ(std::ranges::count(pictures, picture), 0) << "it would not matter which one ran";
        pictures.push_back(picture);
    }
}

TEST_F(CDlgMainImplTest, EveryOtherButtonAndMenuEntryOpensItsMode) {
    SettingsEdit edit;
    PresetTree::write(edit, Mode_Advanced, QStringLiteral("Mine"), FactoryPresets::contentOf("Portrait"));
    edit.commit();
    EXPECT_EQ(opens([&] {
                  for (const char* name :
                       {"btnAdjustments", "btnAddIllumination", "btnAdvanced", "btnCustomPresets"})
                      click(name);
              }),
              "33:Adjustments|19:Add Illumination|12:Advanced|-1:Choose a preset to apply");
    QStringList texts;
    const std::string opened = opens([&] {
        click("btnIndivFilters");
        const QPointer<QMenu> menu = mWindow->findChild<QMenu*>();
        ASSERT_TRUE(menu && menu->isVisible());
        EXPECT_EQ(menu->actions()[11]->text(), "B&&W Spots Removal"); // a single one would underline the W
        for (QAction* action : menu->actions()) {
            texts += action->isSeparator() ? QStringLiteral("-") : action->text().replace("&&", "&");
            action->trigger();
        }
        menu->close();
    });
    EXPECT_EQ(
        texts.join('|'),
        "Smart Sharpness|Smart Blur|-|Add Digital Flash|Saturation|-|Smart Contrast|Smart Brightness|Smart "
        "Gamma|Smart Levels|-|B&W Spots Removal|Noise Reduction|Moire Reduction|-|Temperature|Auto "
        "Color|Color Filter|-");
    EXPECT_EQ(opened,
              "17:Smart Sharpness|18:Smart Blur|20:Add Digital Flash|21:Saturation|22:Smart Contrast|"
              "23:Smart Brightness|24:Smart Gamma|32:Smart Levels|25:B&W Spots Removal|26:Noise Reduction|"
              "27:Moire Reduction|28:Temperature|29:Auto Color|30:Color Filter");
}

TEST_F(CDlgMainImplTest, BatchModeIsStoredAtTheEndAndReplaysTheLastOperation) {
    QString said;
    run([&] { click("btnAutomatic"); });
    const std::vector<std::uint8_t> automatic = testplanes::bytes(mOutput);
    reopen();
    run([&] {
        answerBox(QMessageBox::Ok, said);
        click("btnToggleBatchMode");
        EXPECT_FALSE(CBatchMode::instance().isBatchModeEnabled());
        mWindow->close();
    });
    EXPECT_EQ(said.section('|', 0, 0), "Batch Mode Enabled");
    reopen();
    EXPECT_TRUE(CBatchMode::instance().isBatchModeEnabled());
    bool shown = false;
    QTimer::singleShot(0, &*mWindow, [&] { shown = mWindow->isVisible(); });
    EXPECT_TRUE(mWindow->run());
    EXPECT_FALSE(shown);
    EXPECT_EQ(testplanes::bytes(mOutput), automatic);
}

TEST_F(CDlgMainImplTest, BatchModeWithNothingToReplayShowsTheWindow) {
    QString said;
    run([&] {
        answerBox(QMessageBox::Ok, said);
        click("btnToggleBatchMode");
        mWindow->close();
    });
    for (const int stored : {-1, 16, 31, 99, int(Mode_Batch)}) {
        SCOPED_TRACE(stored);
        CBatchMode::instance().setBatchMode(stored);
        reopen();
        bool shown = false;
        EXPECT_TRUE(run([&] {
            shown = mWindow->isVisible();
            // Who cancels a mode has another to choose, and not the one of then in its place.
            CBatchMode::instance().setBatchMode(Mode_Adjustments);
            click("btnAutoLevels");
        }));
        EXPECT_TRUE(shown);
        EXPECT_TRUE(testplanes::bytes(mOutput) ==
                    engineResult(CUserParamsPhotoshop(Mode_AutoLevels), mProxy.plane(), mProxy));
    }
    EXPECT_TRUE(CBatchMode::instance().replays());
    for (const int stored : {int(Mode_Automatic), int(Mode_Custom)}) {
        CBatchMode::instance().setBatchMode(stored);
        EXPECT_TRUE(CBatchMode::instance().replays());
    }
}

// A program of its own, since the key counts when that starts.
[[noreturn]] void startWithShift() {
    openSettings().setValue(QStringLiteral("2000/GUI/batchModeEnabled"), true);
    openSettings().setValue(QStringLiteral("2000/GUI/batchMode"), int(Mode_Adjustments));
    Keyboard::setShiftState([] { return 128; });
    const auto picture = testplanes::noise(16, 12);
    CARGBPlane output(*picture, QStringLiteral("output"));
    const CARGBPlaneProxyDirect proxy(*picture);
    QString said;
    answerBox(QMessageBox::Ok, said);
    CDlgMainImpl window(nullptr, picture.get(), &output);
    bool shown = false;
    QTimer::singleShot(0, &window, [&] {
        shown = window.isVisible();
        window.close();
    });
    const bool result = window.run();
    const bool off = said == "Batch Mode|Batch mode is now off." && !CBatchMode::instance().replays();
    QDir(qEnvironmentVariable("XDG_CONFIG_HOME")).removeRecursively();
    std::_Exit(shown && off && !result ? 0 : 1);
}

TEST(CDlgMainImplDeathTest, ShiftAtTheStartEndsBatchModeAndShowsTheWindow) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(startWithShift(), testing::ExitedWithCode(0), "");
}

TEST_F(CDlgMainImplTest, F1OpensTheManualInEveryLayout) {
    run([&] {
        for (const char* layout : {"btnExpand", "btnCollapse", "btnExpand"}) {
            click(layout);
            mWindow->activateWindow();
            EXPECT_TRUE(QTest::qWaitForWindowActive(&*mWindow));
            QTest::keyClick(&*mWindow, Qt::Key_F1);
            const QPointer<QWidget> opened = help();
            EXPECT_TRUE(opened && opened->close()) << layout;
        }
        mWindow->close();
    });
}

TEST_F(CDlgMainImplTest, IsPaintedDarkWhereTheEnvironmentSaysSo) {
    EXPECT_EQ(mWindow->styleSheet(), "");
    const EnvironmentVariable dark("ORVELA_STYLESHEET", "");
    reopen();
    EXPECT_TRUE(mWindow->styleSheet().startsWith("color: white;background: qlineargradient("));
    mWindow->show();
    QImage image(1, 1, QImage::Format_RGB32);
    mWindow->render(&image); // its left upper corner
    EXPECT_LT(qGray(image.pixel(0, 0)), 0x40);
}

TEST_F(CDlgMainImplTest, AnUpdateThatWasFoundIsLinked) {
    openSettings().setValue(QStringLiteral("UpdateAvailable"), QStringLiteral("2.5\"><b>"));
    reopen();
    const auto* label = mWindow->findChild<QLabel*>("updateAvailableLabel");
    EXPECT_FALSE(label->isHidden());
    EXPECT_EQ(label->text(),
              "<a href=\"http://kestrand.example/update2.5&quot;&gt;&lt;b&gt;.html\">Update Available</>");
    EXPECT_TRUE(label->focusPolicy() & Qt::TabFocus); // for those without a mouse
    EXPECT_TRUE(label->openExternalLinks());
}

TEST_F(CDlgMainImplTest, AboutAndInformationsMayLoseTheirParent) {
    for (const auto show : {static_cast<void (CDlgMainImpl::*)(QDialog*)>(&CDlgMainImpl::doAbout),
                            &CDlgMainImpl::doProgramInfos}) {
        const QPointer<QDialog> parent = new QDialog;
        const ModalDialogs user([&](QDialog&) { delete parent; });
        ((*mWindow).*show)(parent);
        EXPECT_FALSE(parent);
        EXPECT_EQ(user.count, 1);
    }
}

TEST_F(CDlgMainImplTest, StaysWhileAModeRunsWhateverItsFrameIsAsked) {
    bool stayed = false;
    EXPECT_TRUE(run([&] {
        QTimer::singleShot(0, &*mWindow, [&] { // in the midst of the run
            mWindow->close();
            stayed = mWindow->isVisible();
        });
        click("btnAutomatic");
    }));
    EXPECT_TRUE(stayed);
}

TEST_F(CDlgMainImplTest, SaysHowToEndBatchModeInBold) {
    QString said;
    const ModalDialogs reader([&said](QDialog& dialog) {
        auto* box = qobject_cast<QMessageBox*>(&dialog);
        if (!box)
            return;
        EXPECT_EQ(box->textFormat(), Qt::RichText);
        said = box->text();
        box->accept();
    });
    run([&] {
        click("btnToggleBatchMode");
        mWindow->close();
    });
    EXPECT_TRUE(said.contains("orvela.<br><br>To disable batch mode, hold <b>SHIFT</b>")) << qPrintable(said);
}

TEST_F(CDlgMainImplTest, InBatchModeLeavesAloneWhereItWasLast) {
    run([&] { click("btnAutomatic"); });
    const QString place = QStringLiteral("2000/GUI/CDlgMainImpl/pos");
    openSettings().setValue(place, QPoint(77, 88));
    CBatchMode::instance().setBatchModeEnabled(true);
    reopen();
    mWindow->move(5, 6);
    EXPECT_TRUE(mWindow->run());
    EXPECT_EQ(openSettings().value(place).toPoint(), QPoint(77, 88));
}

TEST_F(CDlgMainImplTest, LeavesItsHelpAsItIsAndInUse) {
    bool usable = false;
    const ModalDialogs hand([&](QDialog& dialog) {
        if (dialog.objectName() != QLatin1String("CDlgSettings"))
            return;
        QTest::qWait(50);
        usable = help()->isEnabled() && help()->parentWidget() == &dialog;
        dialog.reject();
    });
    run([&] {
        click("btnHelp");
        ASSERT_TRUE(help());
        const QList<QToolButton*> buttons = help()->findChildren<QToolButton*>();
        ASSERT_FALSE(buttons.isEmpty());
        click("btnExpand");
        for (const QToolButton* each : buttons)
            EXPECT_NE(each->minimumWidth(), 124);
        click("btnAdvanced");
        help()->close();
        mWindow->close();
    });
    EXPECT_TRUE(usable);
}

TEST_F(CDlgMainImplTest, NamesEveryButtonForWhoDoesNotSeeIt) {
    run([&] {
        for (const char* layout : {"btnCollapse", "btnExpand", "btnCollapse"}) {
            click(layout);
            for (const char* state : {"Batch Mode is on", "Batch Mode is off"}) {
                messageBoxes([&] { click("btnToggleBatchMode"); });
                EXPECT_EQ(button("btnToggleBatchMode")->accessibleName(), state) << layout;
            }
            for (const QToolButton* each : mWindow->findChildren<QToolButton*>())
                EXPECT_FALSE(each->accessibleName().isEmpty()) << layout << qPrintable(each->objectName());
        }
        mWindow->close();
    });
}

} // namespace
