#include "GUI/Windows/CDlgMainImpl.h"

#include "GUI/Presets/CBatchMode.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/SettingsStore.h"
#include "support/BoxAnswer.h"
#include "support/ModalDialog.h"
#include "support/TestPlanes.h"

#include <QLabel>
#include <QMenu>
#include <QPointer>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class CDlgMainImplTest : public testing::Test {
protected:
    CDlgMainImplTest() {
        openSettings().clear();
        mWindow.emplace(nullptr, mInput.get(), &mOutput);
    }
    ~CDlgMainImplTest() override { openSettings().clear(); }

    bool run(const std::function<void()>& user) {
        QTimer::singleShot(0, &*mWindow, user);
        return mWindow->run();
    }

    QToolButton* button(const char* name) { return mWindow->findChild<QToolButton*>(QLatin1String(name)); }
    void click(const char* name) { QTest::mouseClick(button(name), Qt::LeftButton); }
    void reopen() {
        mWindow.reset();
        mWindow.emplace(nullptr, mInput.get(), &mOutput);
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
    EXPECT_NE(testplanes::bytes(mOutput), testplanes::bytes(mProxy.plane()));
}

TEST_F(CDlgMainImplTest, TheMenuOffersEveryFilterAndRunsTheChosenOne) {
    QStringList texts;
    QString title;
    const ModalDialogs hand([&](QDialog& dialog) {
        if (dialog.objectName() != QLatin1String("CDlgSettings"))
            return;
        title = dialog.windowTitle();
        dialog.reject();
    });
    run([&] {
        click("btnIndivFilters");
        auto* menu = mWindow->findChild<QMenu*>();
        ASSERT_TRUE(menu && menu->isVisible());
        for (const QAction* action : menu->actions())
            texts += action->isSeparator() ? QStringLiteral("-") : action->text().replace("&&", "&");
        EXPECT_EQ(menu->actions()[11]->text(), "B&&W Spots Removal"); // a single one would underline the W
        menu->actions()[3]->trigger();
        menu->close();
        mWindow->close();
    });
    EXPECT_EQ(
        texts.join('|'),
        "Smart Sharpness|Smart Blur|-|Add Digital Flash|Saturation|-|Smart Contrast|Smart Brightness|Smart "
        "Gamma|Smart Levels|-|B&W Spots Removal|Noise Reduction|Moire Reduction|-|Temperature|Auto "
        "Color|Color Filter|-");
    EXPECT_EQ(title, "Add Digital Flash");
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
    mInput->copyFrom(mProxy.plane());
    mOutput.copyFrom(mProxy.plane());
    reopen();
    EXPECT_TRUE(CBatchMode::instance().isBatchModeEnabled());
    bool shown = false;
    QTimer::singleShot(0, &*mWindow, [&] { shown = mWindow->isVisible(); });
    EXPECT_TRUE(mWindow->run());
    EXPECT_FALSE(shown);
    EXPECT_EQ(testplanes::bytes(mOutput), automatic);
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
    const auto help = [] {
        for (QWidget* window : QApplication::topLevelWidgets())
            if (window->objectName() == QLatin1String("HelpWindow"))
                return window;
        return static_cast<QWidget*>(nullptr);
    };
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
    for (const QToolButton* each : mWindow->findChildren<QToolButton*>())
        EXPECT_FALSE(each->accessibleName().isEmpty()) << qPrintable(each->objectName());
}

} // namespace
