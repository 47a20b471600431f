#include "GUI/Panes/CWgtPaneAdvancedImpl.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "PaneFixture.h"

#include <QScreen>
#include <QTest>

#include <gtest/gtest.h>

#include <algorithm>

using namespace orvela;

TEST(CWgtPaneAdvancedImpl, FoldsTheRarelyUsedGroupsAway) {
    const Shown<CWgtPaneAdvancedImpl> shown(Mode_Advanced);
    CWgtPaneAdvancedImpl* const pane = shown.pane;
    pane->window()->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(pane->window()));
    const auto expectExtended = [pane](bool extended) {
        for (const QWidget* part :
             std::initializer_list<QWidget*>{pane->grpBxPerceptualAbsolute, pane->grpBxArtefacts,
                                             pane->grpBxColor, pane->btnCollapseSettings})
            EXPECT_EQ(part->isVisible(), extended) << qPrintable(part->objectName());
        EXPECT_EQ(pane->btnExtendSettings->isVisible(), !extended);
        EXPECT_TRUE(pane->sldrFade->isVisible() && pane->sldrAutoContrast->isHidden());
    };
    expectExtended(false);
    pane->btnExtendSettings->setFocus();
    QTest::mouseClick(pane->btnExtendSettings, Qt::LeftButton);
    expectExtended(true);
    EXPECT_TRUE(pane->btnCollapseSettings->hasFocus()) << "the one that took the place";
    QTest::mouseClick(pane->lblExtendedSettings, Qt::LeftButton);
    expectExtended(false);
    QTest::mouseClick(pane->lblExtendedSettings, Qt::RightButton);
    expectExtended(false);
    QTest::mouseClick(pane->lblExtendedSettings, Qt::LeftButton);
    expectExtended(true);
    pane->sldrColorFilter->setEnabled(true);
    EXPECT_TRUE(pane->colrPickAutoColor->isVisible());
    pane->sldrColorFilter->setEnabled(false);
    EXPECT_FALSE(pane->colrPickAutoColor->isVisible());
    QTest::mouseClick(pane->btnCollapseSettings, Qt::LeftButton);
    expectExtended(false);
}

TEST(CWgtPaneAdvancedImpl, ScrollsToTheRowThatTabReaches) {
    const Shown<CWgtPaneAdvancedImpl> shown(Mode_Advanced);
    shown.pane->on_btnExtendSettings_clicked();
    shown.pane->window()->resize(320, 300);
    shown.pane->window()->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(shown.pane->window()));
    shown.pane->sldrOrvela3->setEnabled(true);
    shown.pane->sldrFade->setEnabled(true);
    shown.pane->sldrOrvela3->txtValue->setFocus();
    for (QWidget* part :
         std::initializer_list<QWidget*>{shown.pane->sldrFade->lmpState, shown.pane->sldrFade->sldrValue}) {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        EXPECT_TRUE(part->hasFocus());
        EXPECT_FALSE(part->visibleRegion().isEmpty());
    }
}
