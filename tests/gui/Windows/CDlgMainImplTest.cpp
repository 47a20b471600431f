#include "GUI/Windows/CDlgMainImpl.h"

#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CBatchMode.h"
#include "Settings/FactoryPresets.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/EnvironmentVariable.h"
#include "support/ModalDialog.h"

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
            EXPECT_TRUE(mWindow->isVisible() && mWindow->isEnabled()) << "there is another to choose";
            mWindow->reject();
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

TEST_F(CDlgMainImplTest, EveryAutomaticButtonAppliesItsModeWhateverTheFrameIsAskedMeanwhile) {
    std::vector<std::vector<std::uint8_t>> pictures;
    for (const auto& [name, mode] : {std::pair("btnAutomatic", Mode_Automatic),
                                     {"btnAutoContrast", Mode_AutoContrast},
                                     {"btnAutoLevels", Mode_AutoLevels},
                                     {"btnAutoColor", Mode_AutoColor},
                                     {"btnAutoSaturation", Mode_AutoSaturation}}) {
        SCOPED_TRACE(name);
        reopen();
        bool stayed = false;
        EXPECT_TRUE(run([&, name = name] {
            QTimer::singleShot(0, &*mWindow, [&] { // in the midst of the run
                mWindow->close();
                stayed = mWindow->isVisible();
            });
            click(name);
        }));
        EXPECT_TRUE(stayed);
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
    QString layout; // of the menu: filters and separators
    const std::string opened = opens([&] {
        click("btnIndivFilters");
        const QPointer<QMenu> menu = mWindow->findChild<QMenu*>();
        ASSERT_TRUE(menu && menu->isVisible());
        EXPECT_EQ(menu->actions()[11]->text(), "B&&W Spots Removal"); // a single one would underline the W
        for (QAction* action : menu->actions()) {
            layout += action->isSeparator() ? '-' : 'f';
            action->trigger();
        }
        menu->close();
    });
    EXPECT_EQ(layout, "ff-ff-ffff-fff-fff-");
    EXPECT_EQ(opened,
              "17:Smart Sharpness|18:Smart Blur|20:Add Digital Flash|21:Saturation|22:Smart Contrast|"
              "23:Smart Brightness|24:Smart Gamma|32:Smart Levels|25:B&W Spots Removal|26:Noise Reduction|"
              "27:Moire Reduction|28:Temperature|29:Auto Color|30:Color Filter");
}

TEST_F(CDlgMainImplTest, BatchModeIsStoredAtTheEndAndReplaysTheLastOperationUnseen) {
    run([&] { click("btnAutomatic"); });
    const std::vector<std::uint8_t> automatic = testplanes::bytes(mOutput);
    reopen();
    QString said;
    const ModalDialogs reader([&said](QDialog& dialog) {
        if (auto* box = qobject_cast<QMessageBox*>(&dialog)) {
            EXPECT_EQ(box->textFormat(), Qt::RichText);
            said = box->windowTitle() + '|' + box->text();
            box->accept();
        }
    });
    run([&] {
        click("btnToggleBatchMode");
        EXPECT_FALSE(CBatchMode::instance().isBatchModeEnabled());
        mWindow->close();
    });
    EXPECT_TRUE(said.startsWith("Batch Mode Enabled|Batch mode is now enabled!")) << qPrintable(said);
    EXPECT_TRUE(said.contains("orvela.<br><br>To disable batch mode, hold <b>SHIFT</b>")) << qPrintable(said);
    const QString place = QStringLiteral("2000/GUI/CDlgMainImpl/pos");
    openSettings().setValue(place, QPoint(77, 88));
    reopen();
    EXPECT_TRUE(CBatchMode::instance().isBatchModeEnabled());
    mWindow->move(5, 6);
    bool shown = false;
    EXPECT_TRUE(run([&] { shown = mWindow->isVisible(); }));
    EXPECT_FALSE(shown);
    EXPECT_EQ(testplanes::bytes(mOutput), automatic);
    EXPECT_EQ(openSettings().value(place).toPoint(), QPoint(77, 88)) << "it was nowhere";
}

TEST_F(CDlgMainImplTest, BatchModeWithNothingToReplayShowsTheWindow) {
    CBatchMode::instance().setBatchModeEnabled(true);
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
    for (const EGUIMode stored : {Mode_Automatic, Mode_Adjustments, Mode_Custom}) {
        CBatchMode::instance().setBatchMode(stored);
        EXPECT_TRUE(CBatchMode::instance().replays());
    }
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

TEST_F(CDlgMainImplTest, F1OpensTheManualInEveryLayoutWhichIsLeftAsItIsAndInUse) {
    bool usable = false;
    const ModalDialogs hand([&](QDialog& dialog) {
        if (dialog.objectName() != QLatin1String("CDlgSettings"))
            return;
        QTest::qWait(50);
        usable = help()->isEnabled() && help()->parentWidget() == &dialog;
        dialog.reject();
    });
    run([&] {
        for (const char* layout : {"btnExpand", "btnCollapse"}) {
            if (help())
                help()->close();
            click(layout);
            mWindow->activateWindow();
            EXPECT_TRUE(QTest::qWaitForWindowActive(&*mWindow));
            QTest::keyClick(&*mWindow, Qt::Key_F1);
            if (!help()) {
                ADD_FAILURE() << layout;
                return mWindow->reject();
            }
        }
        click("btnExpand");
        const QList<QToolButton*> buttons = help()->findChildren<QToolButton*>();
        ASSERT_FALSE(buttons.isEmpty());
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
