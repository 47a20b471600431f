#include "GUI/Controls/CColorPicker.h"
#include "GUI/Panes/CWgtPaneFinalTouchImpl.h"
#include "PaneFixture.h"

#include <QAccessible>
#include <QComboBox>
#include <QTest>

#include <gtest/gtest.h>

#include <map>

using namespace orvela;

namespace {

class FinalTouchPane : public testing::Test {
protected:
    Shown<CWgtPaneFinalTouchImpl> shown{Mode_FinalTouch};
    CWgtPaneFinalTouchImpl* pane = shown.pane;
};

std::vector<Drives> drives() {
    std::vector<Drives> sliders = {
        {"sldrAbsContrast", "mContrast_Touch_Value", "mContrast_Touch_Enabled"},
        {"sldrPercContrast", "mPerceptual_Contrast_Touch_Value", "mPerceptual_Contrast_Touch_Enabled"},
        {"sldrAbsBrightness", "mBrightness_Touch_Value", "mBrightness_Touch_Enabled"},
        {"sldrPercBrightness", "mPerceptual_Brightness_Touch_Value", "mPerceptual_Brightness_Touch_Enabled"},
        {"sldrAbsColorFilter", "mColor_Intensity_Touch_Value", "mColor_Touch_Enabled"},
    };
    const std::pair<std::string, std::string> tones[] = {
        {"Shadows", "Dark"}, {"Middle", "Middle"}, {"Highlights", "Light"}};
    for (const auto& [shownTone, tone] : tones) {
        for (const std::string channel : {"R", "G", "B", "RGB"}) {
            sliders.push_back({"sldrAbs" + shownTone + channel, "m" + tone + "_Touch_Value_" + channel,
                               "m" + tone + "_Touch_" + channel + "_Enabled"});
            const std::string perceptual = "mPerceptual_Touch_" + tone;
            sliders.push_back({"sldrPerc" + shownTone + channel, perceptual + "_Value_" + channel,
                               perceptual + '_' + channel + "_Enabled"});
        }
    }
    return sliders;
}

TEST_F(FinalTouchPane, StartsNeutralAndWritesEverySliderIntoItsOwnFields) {
    pane->sldrAbsMiddleRGB->setEnabled(true);
    for (int round = 0; round < 2; ++round) {
        pane->setSliders(QStringLiteral("Automatic"));
        const std::map<std::string, const char*> texts = {{"Shadows", "0.0"},      {"Middle", "1.0"},
                                                          {"Highlights", "255.0"}, {"Contrast", "0.0"},
                                                          {"Brightness", "0.0"},   {"Color Filter", "0.0"}};
        for (const PaneSlider& slider : PaneTable::sliders(Mode_FinalTouch)) {
            const COrvelaSliderBlockImpl* block = blockOf(pane, slider.object);
            EXPECT_FALSE(block->isEnabled()) << slider.object;
            EXPECT_STREQ(qPrintable(block->txtValue->text()), texts.at(slider.slider.label)) << slider.object;
        }
    }
    EXPECT_EQ(PaneTable::sliders(Mode_FinalTouch).size(), drives().size() + 1);
    pane->colrPickPercColorFilter->setColor(QColor(9, 8, 7));
    expectWrites(pane, drives(), "mColor_Touch_Value_", QColor(9, 8, 7));
    for (const PaneSlider& slider : PaneTable::sliders(Mode_FinalTouch))
        expectShowsEveryPosition(pane, slider);
}

TEST_F(FinalTouchPane, ColorFiltersAndPickersMirrorEachOther) {
    COrvelaSliderBlockImpl* const sliders[] = {pane->sldrPercColorFilter, pane->sldrAbsColorFilter};
    CColorPicker* const pickers[] = {pane->colrPickPercColorFilter, pane->colrPickAbsColorFilter};
    for (const int from : {0, 1}) {
        const int to = 1 - from;
        pane->tabCtnrFinalTouch->setCurrentIndex(from);
        EXPECT_FALSE(pickers[from]->isVisible());
        sliders[from]->setEnabled(true);
        EXPECT_TRUE(sliders[to]->isEnabled());
        EXPECT_TRUE(pickers[from]->isVisible());
        sliders[from]->txtValue->selectAll();
        QTest::keyClicks(sliders[from]->txtValue, from == 0 ? "12.3" : "45.6");
        EXPECT_EQ(sliders[from]->txtValue->text(), QLatin1String(from == 0 ? "12.3" : "45.6"));
        EXPECT_NEAR(sliders[to]->value(), from == 0 ? 123 : 456, 1e-9);
        CThinHorizontalSlider* thin = sliders[from]->sldrValue;
        QTest::mouseClick(thin, Qt::LeftButton, {}, QPoint(thin->width() / 3, 3));
        EXPECT_GT(sliders[to]->value(), 300);
        EXPECT_EQ(sliders[to]->value(), sliders[from]->value());
        pickers[from]->setColor(QColor(from, 20, 30));
        EXPECT_EQ(pickers[to]->color(), QColor(from, 20, 30));
        sliders[from]->setEnabled(false);
        EXPECT_FALSE(sliders[to]->isEnabled() || pickers[from]->isVisible());
        pane->setSliders(QString());
    }
}

TEST_F(FinalTouchPane, GoesOnFromTheProcessedImageAndLeadsBack) {
    EXPECT_TRUE(pane->autoRefresh() && pane->takesProcessedImage() && !pane->showsPresets());
    QComboBox list;
    pane->fillPresetList(&list);
    ASSERT_EQ(list.count(), 1);
    EXPECT_EQ(list.itemText(0), QStringLiteral("Automatic"));
    EXPECT_FALSE(list.itemIcon(0).isNull());
    expectLeadsOn(pane, pane->btnBack, "CThreadedCore_FinalTouch", Mode_Advanced);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(pane->tabCtnrAbsRGB->tabBar())
                  ->child(3)
                  ->text(QAccessible::Name),
              QStringLiteral("All channels"));
}

} // namespace
