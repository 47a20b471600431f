#include "GUI/Windows/CDlgCustomPresetImpl.h"

#include "Settings/FactoryPresets.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "support/BoxAnswer.h"
#include "support/ModalDialog.h"

#include <QTest>

using namespace orvela;

namespace {

/// A store without settings.
class CDlgCustomPresetImplTest : public testing::Test {
protected:
    CDlgCustomPresetImplTest() { openSettings().clear(); }

    void store(EGUIMode mode, const QStringList& names) {
        SettingsEdit edit;
        for (const QString& name : names)
            PresetTree::write(edit, mode, name, FactoryPresets::contentOf("Portrait"));
        edit.commit();
    }

    /// Has a user at work in the chooser.
    QString choose(const std::function<void(CDlgCustomPresetImpl&)>& user, QWidget* parent = nullptr) {
        const ModalDialogs dialogs([&user](QDialog& dialog) {
            if (auto* chooser = qobject_cast<CDlgCustomPresetImpl*>(&dialog))
                user(*chooser);
        });
        return CDlgCustomPresetImpl::choose(parent, [this](const QString& page) { mPages.append(page); });
    }

    QStringList mPages;
};

void click(QWidget* button) {
    QTest::mouseClick(button, Qt::LeftButton);
}

} // namespace

TEST_F(CDlgCustomPresetImplTest, OffersThePresetsOfAdvancedWithHelpAndReturnsTheChosenOne) {
    store(Mode_Advanced, {"Mine", "my/own & <b>bold</b>", "Zoo", PresetTree::batchPresetName()});
    store(Mode_SmartBlur, {"Blurred"});
    EXPECT_EQ(choose([](CDlgCustomPresetImpl& chooser) {
                  QStringList offered;
                  for (int index = 0; index < chooser.lstBxPreset->count(); ++index)
                      offered.append(chooser.lstBxPreset->itemText(index));
                  offered.sort();
                  EXPECT_EQ(offered, QStringList({"Mine", "Zoo", "my/own & <b>bold</b>"}));
                  EXPECT_FALSE(chooser.lstBxPreset->itemIcon(2).isNull());
                  click(chooser.btnHelp);
                  EXPECT_TRUE(chooser.isVisible());
                  QTest::keyClicks(chooser.lstBxPreset, "my");
                  click(chooser.btnOK);
              }),
              QString("my/own & <b>bold</b>"));
    EXPECT_EQ(choose([this](CDlgCustomPresetImpl& chooser) {
                  EXPECT_EQ(chooser.chosenIndex(), -1);
                  EXPECT_EQ(mPages, QStringList("presetandcustomfilters.htm"));
                  QTest::keyClick(chooser.lstBxPreset, Qt::Key_End);
                  QTest::keyClick(chooser.lstBxPreset, Qt::Key_Return);
                  EXPECT_EQ(chooser.chosenIndex(), 2);
              }),
              QString("my/own & <b>bold</b>"));
}

TEST_F(CDlgCustomPresetImplTest, CancelEscapeAndClosingChooseNothing) {
    store(Mode_Advanced, {"Mine"});
    EXPECT_EQ(choose([](CDlgCustomPresetImpl& chooser) { click(chooser.btnCancel); }), QString());
    EXPECT_EQ(choose([](CDlgCustomPresetImpl& chooser) { QTest::keyClick(&chooser, Qt::Key_Escape); }),
              QString());
    EXPECT_EQ(choose([](CDlgCustomPresetImpl& chooser) { chooser.close(); }), QString());
    EXPECT_TRUE(mPages.isEmpty());
    auto* parent = new QWidget; // goes away with the chooser that it owns
    EXPECT_EQ(choose([parent](CDlgCustomPresetImpl&) { delete parent; }, parent), QString());
}

TEST_F(CDlgCustomPresetImplTest, WithoutAnyPresetItFailsAndWithNoneOfAdvancedItSaysSo) {
    const auto work = [](CDlgCustomPresetImpl& chooser) {
        click(chooser.btnOK);
        EXPECT_EQ(chooser.result(), QDialog::Rejected);
    };
    try {
        choose(work);
        FAIL() << "There was nothing to choose from.";
    } catch (const CGenericEx& failure) {
        EXPECT_EQ(failure.message(), "There are no custom preset to load.");
    }
    store(Mode_SmartBlur, {"Blurred"});
    QString said;
    answerBox(QMessageBox::Ok, said);
    EXPECT_EQ(choose(work), QString());
    EXPECT_EQ(said, "Information|You don't have any profiles yet. You can create and save profiles in the "
                    "Advanced mode window.");
}

TEST_F(CDlgCustomPresetImplTest, OpensWhereItWasClosedInItsOneSizeAboveTheOthers) {
    store(Mode_Advanced, {"Mine", QString(300, 'W')});
    QPoint left;
    choose([&left](CDlgCustomPresetImpl& chooser) {
        chooser.move(213, 157);
        left = chooser.pos();
        click(chooser.btnOK);
    });
    choose([&left](CDlgCustomPresetImpl& chooser) {
        EXPECT_EQ(chooser.pos(), left);
        EXPECT_EQ(chooser.minimumSize(), chooser.maximumSize());
        EXPECT_LT(chooser.width(), 600);
        EXPECT_EQ(chooser.windowFlags() & (Qt::WindowType_Mask | Qt::WindowStaysOnTopHint),
                  Qt::Tool | Qt::WindowStaysOnTopHint);
        chooser.close();
    });
}
