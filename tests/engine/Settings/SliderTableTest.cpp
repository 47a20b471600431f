#include "Settings/PaneTable.h"
#include "Settings/SettingFields.h"
#include "support/SettingsMap.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>

using namespace orvela;

namespace {

TEST(SliderTable, ScalesShowTheDocumentedNumbersAndComeBack) {
    using namespace SliderScales;
    // Shown at positions 0, 500 and 1000.
    const std::map<const SliderScale*, std::array<double, 3>> expected = {
        {&Tenth, {0, 50, 100}},        {&Hundredth, {0, 5, 10}},
        {&Thousandth, {0, 0.5, 1}},    {&Temperature, {2000, 6000, 10000}},
        {&Sharpness, {30, 50.5, 71}},  {&Noise, {0.5, 2.75, 5}},
        {&Spots, {0.5, 50.25, 100}},   {&Moire, {0.1, 5.05, 10}},
        {&Contrast, {-100, 0, 100}},   {&Brightness, {-255, 0, 255}},
        {&Gamma, {0.1, 1, 10}},        {&Shadows, {0, 127.5, 255}},
        {&Highlights, {255, 127.5, 0}}};
    EXPECT_EQ(Gamma.text(575), "2.3"); // 2.35 lies between two texts
    EXPECT_EQ(Gamma.text(250), "0.6"); // 0.55
    EXPECT_NEAR(Noise.told(250), (1.6 - 0.5) / 0.0045, 1e-9);
    std::set<const SliderScale*> used;
    for (const SliderDescription& slider : SliderTable::sliders())
        used.insert(slider.scale);
    EXPECT_EQ(used.size(), expected.size());
    for (const auto& [scale, shown] : expected) {
        EXPECT_EQ(scale->low(), shown[0]);
        EXPECT_NEAR(scale->toShown(500), shown[1], 1e-9);
        EXPECT_EQ(scale->high(), shown[2]);
        for (int position = 0; position <= 1000; ++position)
            EXPECT_NEAR(scale->toPosition(scale->toShown(position)), position, 1e-6);
    }
}

TEST(SliderTable, EveryFieldIsDrivenOnceAndByItsStage) {
    for (const SliderField& field : sliderFields()) {
        const std::string name = field.name;
        int drivers = 0;
        for (const SliderDescription& slider : SliderTable::sliders())
            drivers += field.value ? slider.value == field.value : slider.enabled == field.flag;
        for (const ColorDescription& color : SliderTable::colors())
            drivers += field.value && std::count(color.parts.begin(), color.parts.end(), field.value);
        const bool idle = name == "mPerceptual_Touch_Dark_Enabled" || name == "Noise_Cleaner_Off";
        EXPECT_EQ(drivers, idle ? 0 : 1) << name;
        const bool touch = !idle && name.find("_Touch_") != std::string::npos;
        CSliderParams sliders;
        field.value ? void(sliders.*field.value = 3) : void(sliders.*field.flag = true);
        for (const bool other : {false, true}) {
            const auto stage = touch != other ? SettingStage::FinalTouch : SettingStage::Main;
            EXPECT_EQ(settingsOf(SettingFields::ofStage(sliders, stage)).count(name), other ? 0U : 1U)
                << name;
            EXPECT_EQ(SettingFields::anyOn(sliders, stage), !other && !idle && field.flag) << name;
        }
    }
}

TEST(PaneTable, EverySliderHasOneControlInThePaneOfItsStageAndAHelp) {
    std::map<const SliderDescription*, int> controls;
    std::set<std::string> objects;
    for (const EGUIMode mode : {Mode_Advanced, Mode_FinalTouch}) {
        for (const PaneSlider& each : PaneTable::sliders(mode)) {
            EXPECT_TRUE(objects.insert(each.object).second) << each.object;
            EXPECT_EQ(each.slider.stage == SettingStage::FinalTouch, mode == Mode_FinalTouch);
            controls[&each.slider] += each.mirror ? 0 : 1;
        }
    }
    for (const SliderDescription& slider : SliderTable::sliders()) {
        EXPECT_EQ(controls[&slider], 1) << slider.help;
        const std::string help = slider.help;
        EXPECT_TRUE(std::isupper(help.front()) && help.find('.') > 20 && help.back() == '.') << help;
    }
    EXPECT_EQ(controls.size(), SliderTable::sliders().size());
}

} // namespace
