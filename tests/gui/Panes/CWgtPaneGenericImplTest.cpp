#include "GUI/Panes/CWgtPaneGenericImpl.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "PaneFixture.h"
#include "support/SettingsMap.h"

#include <gtest/gtest.h>

using namespace orvela;

TEST(CWgtPaneGenericImpl, PickerShowsWhileItsSliderIsOn) {
    Shown<CWgtPaneGenericImpl> shown(Mode_ColorFilter);
    auto* picker = shown.pane->findChild<CColorPicker*>();
    EXPECT_TRUE(picker->isVisible());
    shown.pane->sldrGeneric->setEnabled(false);
    EXPECT_FALSE(picker->isVisible());
    shown.pane->sldrGeneric->setEnabled(true);
    shown.pane->setSliders(QString()); // no factory preset of this pane: only the reset
    EXPECT_FALSE(shown.pane->sldrGeneric->isEnabled());
    EXPECT_EQ(shown.pane->sldrGeneric->value(), 500);
}

TEST(CWgtPaneGenericImpl, DrivesNothingInAModeOfAnotherPane) {
    CUserParams params;
    const Shown<CWgtPaneGenericImpl> generic(Mode_Advanced);
    EXPECT_EQ(generic.pane->findChild<CColorPicker*>(), nullptr);
    generic.pane->applyGUIParams(params);
    EXPECT_TRUE(settingsOf(params.mSliderParams).empty());
}
