#include "GUI/Panes/CWgtPaneAdvancedImpl.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "PaneFixture.h"

#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

TEST(CWgtPaneAdvancedImpl, FoldsTheRarelyUsedGroupsAway) {
    const Shown<CWgtPaneAdvancedImpl> shown(Mode_Advanced);
    CWgtPaneAdvancedImpl* const pane = shown.pane;
    const auto expectExtended = [pane](bool extended) {
        for (const QWidget* part :
             std::initializer_list<QWidget*>{pane->grpBxPerceptualAbsolute, pane->grpBxArtefacts,
                                             pane->grpBxColor, pane->btnCollapseSettings})
            EXPECT_EQ(part->isVisible(), extended) << qPrintable(part->objectName());
        EXPECT_EQ(pane->btnExtendSettings->isVisible(), !extended);
        EXPECT_TRUE(pane->sldrFade->isVisible() && pane->sldrAutoContrast->isHidden());
    };
    expectExtended(false);
    QTest::mouseClick(pane->btnExtendSettings, Qt::LeftButton);
    expectExtended(true);
    pane->sldrColorFilter->setEnabled(true);
    EXPECT_TRUE(pane->colrPickAutoColor->isVisible());
    pane->sldrColorFilter->setEnabled(false);
    EXPECT_FALSE(pane->colrPickAutoColor->isVisible());
    QTest::mouseClick(pane->btnCollapseSettings, Qt::LeftButton);
    expectExtended(false);
}
