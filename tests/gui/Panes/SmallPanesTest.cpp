#include "Core/CThreadedCore.h"
#include "GUI/Controls/CColorPicker.h"
#include "GUI/Panes/CWgtPane3SlidersImpl.h"
#include "GUI/Panes/CWgtPaneGenericImpl.h"
#include "PaneFixture.h"
#include "Utility/CARGBPlane.h"

#include <gtest/gtest.h>

#include <map>

using namespace orvela;

namespace {

void expectPlainPane(IWgtPane* pane) {
    EXPECT_FALSE(pane->showsPresets() || pane->autoRefresh() || pane->takesProcessedImage());
    CARGBPlane in(8, 8, QStringLiteral("in"));
    CARGBPlane out(8, 8, QStringLiteral("out"));
    const std::unique_ptr<CThreadedCore> core(pane->createCore(&in, &out, nullptr));
    EXPECT_STREQ(core->metaObject()->className(), "CThreadedCore_Orvela");
}

TEST(ThreeSlidersPane, DrivesTheFieldsOfItsMode) {
    const std::pair<EGUIMode, std::vector<Drives>> modes[] = {
        {Mode_Adjustments,
         {{"sldr1", "SaturationValue", "SaturationEnabled"},
          {"sldr2", "PerceptualLight", "PerceptualLightEnabled"},
          {"sldr3", "PerceptualDark", "PerceptualDarkEnabled"}}},
        {Mode_SmartLevels,
         {{"sldr1", "PerceptualLight", "PerceptualLightEnabled"},
          {"sldr2", "PerceptualMiddle", "PerceptualMiddleEnabled"},
          {"sldr3", "PerceptualDark", "PerceptualDarkEnabled"}}}};
    for (const auto& [mode, sliders] : modes) {
        Shown<CWgtPane3SlidersImpl> shown(mode);
        for (const PaneSlider& slider : PaneTable::threeSliders(mode)) {
            const COrvelaSliderBlockImpl* block = blockOf(shown.pane, slider.object);
            const double initial = std::map<std::string, double>{
                {"Saturation", 500}, {"Highlights", 255}, {"Middle", 500}, {"Dark", 0}}[slider.slider.label];
            EXPECT_NEAR(block->value(), initial, snapping(*slider.slider.scale, initial)) << slider.object;
            EXPECT_FALSE(block->isEnabled());
        }
        expectWrites(shown.pane, sliders, "", {});
        for (const PaneSlider& slider : PaneTable::threeSliders(mode))
            expectShowsEveryPosition(shown.pane, slider);
        expectPlainPane(shown.pane);
    }
}

TEST(ThreeSlidersPane, ReportsOtherModes) {
    std::unique_ptr<Shown<CWgtPane3SlidersImpl>> shown;
    EXPECT_EQ(boxes([&shown] { shown = std::make_unique<Shown<CWgtPane3SlidersImpl>>(Mode_FinalTouch); }),
              QStringList(QStringLiteral("Note:|invalid mode in CWgtPane3SlidersImpl::setSliders")));
    EXPECT_EQ(boxes([&shown] { expectWrites(shown->pane, {}, "", {}); }).first(),
              QStringLiteral("Note:|invalid mode in CWgtPane3SlidersImpl::applyGUIParams"));
}

TEST(GenericPane, DrivesTheOneFieldOfItsMode) {
    const QByteArrayList fields =
        QByteArray(
            "OrvelaLevelValue OrvelaLevel3Value ClarityFilterValue mDigital_Flash_Value SaturationValue "
            "Contrast2Value Brightness2Value PerceptualGamma SaltPepperValue BilinearFilteringValue "
            "mMoire_Value Temperature_Value mAuto_Color_Value mColor_Effect_Intensity_Value")
            .split(' ');
    for (int number = Mode_SmartSharpness; number <= Mode_ColorFilter; ++number) {
        SCOPED_TRACE(number);
        const auto mode = static_cast<EGUIMode>(number);
        Shown<CWgtPaneGenericImpl> shown(mode);
        COrvelaSliderBlockImpl* block = shown.pane->sldrGeneric;
        EXPECT_TRUE(block->isEnabled());
        const bool halfway =
            mode == Mode_Saturation || mode == Mode_SmartBrightness || mode == Mode_SmartGamma;
        EXPECT_NEAR(block->value(), halfway ? 500 : 0, 1e-9);
        auto* picker = shown.pane->findChild<CColorPicker*>();
        ASSERT_EQ(picker != nullptr, mode == Mode_ColorFilter);
        if (picker)
            picker->setColor(QColor(1, 2, 200));
        expectWrites(shown.pane, {{"sldrGeneric", fields[number - Mode_SmartSharpness].toStdString(), ""}},
                     picker ? "mColor_Value_" : "", QColor(1, 2, 200));
        expectShowsEveryPosition(shown.pane, *PaneTable::single(mode));
        expectPlainPane(shown.pane);
    }
}

TEST(GenericPane, DrivesNothingInAModeWithoutASliderOfItsOwn) {
    Shown<CWgtPaneGenericImpl> shown(Mode_Advanced);
    EXPECT_EQ(shown.pane->findChild<CColorPicker*>(), nullptr);
    expectWrites(shown.pane, {}, "", {});
}

TEST(GenericPane, ColorFilterStartsWithGreenAndShowsItsPickerWhileOn) {
    Shown<CWgtPaneGenericImpl> shown(Mode_ColorFilter);
    auto* picker = shown.pane->findChild<CColorPicker*>(QStringLiteral("colrPickGeneric"));
    EXPECT_EQ(picker->color(), QColor(0, 255, 0));
    EXPECT_TRUE(picker->isVisible());
    shown.pane->sldrGeneric->setEnabled(false);
    EXPECT_FALSE(picker->isVisible());
    shown.pane->sldrGeneric->setEnabled(true);
    shown.pane->setSliders(QString()); // no factory preset of this pane: only the reset
    EXPECT_FALSE(shown.pane->sldrGeneric->isEnabled());
    EXPECT_EQ(shown.pane->sldrGeneric->value(), 500);
    picker->setColor(Qt::blue);
    EXPECT_EQ(shown.owner.colors.last(), QColor(Qt::blue));
}

} // namespace
