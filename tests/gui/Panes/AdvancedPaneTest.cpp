#include "GUI/Controls/CColorPicker.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "PaneFixture.h"

#include <QAccessible>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class AdvancedPane : public testing::Test {
protected:
    void load(const char* preset) { pane->setSliders(QString::fromLatin1(preset)); }
    void click(QAbstractButton* button) { QTest::mouseClick(button, Qt::LeftButton); }

    Shown<CWgtPaneAdvancedImpl> shown{Mode_Advanced};
    CWgtPaneAdvancedImpl* pane = shown.pane;
};

const std::vector<Drives> kSliders = {
    {"sldrTemperature", "Temperature_Value", "Temperature_Enabled"},
    {"sldrGamma_Abs", "GammaCorrectionValue", "GammaCorrectionEnabled"},
    {"sldrNoise", "BilinearFilteringValue", "BilinearFilteringEnabled"},
    {"sldrAutoContrast", "", "AutoContrast_Enabled"},
    {"sldrContrast_Abs", "ContrastValue", "ContrastEnabled"},
    {"sldrContrast_Perc", "Contrast2Value", "Contrast2Enabled"},
    {"sldrBrightness_Abs", "BrightnessValue", "BrightnessEnabled"},
    {"sldrBrightness_Perc", "Brightness2Value", "Brightness2Enabled"},
    {"sldrIllumination", "ClarityFilterValue", "ClarityFilterEnabled"},
    {"sldrDigitalFlash", "mDigital_Flash_Value", "DigitalFlashEnabled"},
    {"sldrSaturation", "SaturationValue", "SaturationEnabled"},
    {"sldrBlackAndWhiteSpots", "SaltPepperValue", "SaltPepperEnabled"},
    {"sldrOrvela1", "OrvelaLevelValue", "OrvelaLevelEnabled"},
    {"sldrOrvela2", "OrvelaLevel2Value", "OrvelaLevel2Enabled"},
    {"sldrOrvela3", "OrvelaLevel3Value", "OrvelaLevel3Enabled"},
    {"sldrShadows_Perc", "PerceptualDark", "PerceptualDarkEnabled"},
    {"sldrMiddle_Perc", "PerceptualMiddle", "PerceptualMiddleEnabled"},
    {"sldrHighlights_Perc", "PerceptualLight", "PerceptualLightEnabled"},
    {"sldrShadows_Abs", "mAbsolute_Dark_Value", "mAbsolute_Dark_Enabled"},
    {"sldrMiddle_Abs", "mAbsolute_Middle_Value", "mAbsolute_Middle_Enabled"},
    {"sldrHighlights_Abs", "mAbsolute_Light_Value", "mAbsolute_Light_Enabled"},
    {"sldrGamma_Perc", "PerceptualGamma", "PerceptualGammaEnabled"},
    {"sldrMoire", "mMoire_Value", "Moire_Enabled"},
    {"sldrAutoColor", "mAuto_Color_Value", "mAuto_Color_Enabled"},
    {"sldrFade", "mFade_Value", "mFade_Enabled"},
    {"sldrColorFilter", "mColor_Effect_Intensity_Value", "mColor_Effect_Intensity_Enabled"},
};

TEST_F(AdvancedPane, WritesEverySliderIntoItsOwnFields) {
    pane->colrPickAutoColor->setColor(QColor(12, 34, 56));
    expectWrites(pane, kSliders, "mColor_Value_", QColor(12, 34, 56));
}

TEST_F(AdvancedPane, SlidersShowEveryPosition) {
    load("Portrait");
    EXPECT_EQ(pane->sldrContrast_Perc->value(), 550);
    for (const PaneSlider& slider : PaneTable::sliders(Mode_Advanced))
        expectShowsEveryPosition(pane, slider);
}

TEST_F(AdvancedPane, TipsNameSlidersAndTellWhatTheyDo) {
    EXPECT_EQ(pane->sldrFade->toolTip(), "Fade");
    const QString help = pane->sldrFade->sldrValue->toolTip();
    EXPECT_TRUE(help.startsWith("Brings the original back")) << qPrintable(help);
    EXPECT_EQ(pane->sldrFade->whatsThis(), help);
    EXPECT_EQ(
        QAccessible::queryAccessibleInterface(pane->sldrFade->sldrValue)->text(QAccessible::Description),
        help);
}

TEST_F(AdvancedPane, TypedNumbersBecomePositions) {
    load("Portrait");
    pane->sldrGamma_Abs->setEnabled(true);
    for (const auto& [typed, position] : {std::pair("1.0", 500), {"10", 1000}, {"0.1", 0}}) {
        pane->sldrGamma_Abs->txtValue->selectAll();
        QTest::keyClicks(pane->sldrGamma_Abs->txtValue, QLatin1String(typed));
        EXPECT_NEAR(pane->sldrGamma_Abs->value(), position, 1e-9) << typed;
    }
}

TEST_F(AdvancedPane, TellsItsOwnerOfEveryChange) {
    shown.owner.values.clear();
    shown.owner.states.clear();
    pane->sldrFade->setValue(420);
    pane->sldrFade->setEnabled(true);
    pane->colrPickAutoColor->setColor(Qt::red);
    EXPECT_EQ(shown.owner.values, QList<double>{420});
    EXPECT_EQ(shown.owner.states, QList<bool>{true});
    EXPECT_EQ(shown.owner.colors.last(), QColor(Qt::red));
    load("Automatic");
    shown.owner.values.clear();
    pane->sldrFade->setValue(430);
    EXPECT_EQ(shown.owner.values, (QList<double>{430, 430})) << "set up twice, told twice";
}

TEST_F(AdvancedPane, FoldsTheRarelyUsedGroupsAway) {
    const auto expectExtended = [this](bool extended) {
        for (const char* name :
             {"grpBxPerceptualAbsolute", "grpBxArtefacts", "grpBxColor", "btnCollapseSettings"})
            EXPECT_EQ(pane->findChild<QWidget*>(QLatin1String(name))->isVisible(), extended) << name;
        EXPECT_EQ(pane->btnExtendSettings->isVisible(), !extended);
        EXPECT_TRUE(pane->sldrFade->isVisible() && pane->sldrAutoContrast->isHidden());
    };
    expectExtended(false);
    click(pane->btnExtendSettings);
    expectExtended(true);
    pane->sldrColorFilter->setEnabled(true);
    EXPECT_TRUE(pane->colrPickAutoColor->isVisible());
    pane->sldrColorFilter->setEnabled(false);
    EXPECT_FALSE(pane->colrPickAutoColor->isVisible());
    click(pane->btnCollapseSettings);
    expectExtended(false);
}

TEST_F(AdvancedPane, OffersFinalTouchOnceARunWasCompleted) {
    EXPECT_TRUE(pane->showsPresets());
    EXPECT_FALSE(pane->autoRefresh() || pane->takesProcessedImage());
    expectLeadsOn(pane, pane->btnFinalTouch, "CThreadedCore_Orvela", Mode_FinalTouch);
}

} // namespace
