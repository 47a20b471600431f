#include "run/SettingOptions.h"

#include "Settings/PresetConversion.h"
#include "run/ModeNames.h"
#include "run/NearestNames.h"
#include "run/UsageError.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

CSliderParams settled(const SettingOptions& options) {
    return settle(options).params.mSliderParams;
}

TEST(ModeNames, ModesAreFoundByEitherNameInAnyWriting) {
    EXPECT_EQ(ModeNames::find("auto contrast")->mode, Mode_AutoContrast);
    EXPECT_EQ(ModeNames::find("LANDSCAPE-pro")->mode, Mode_LandscapePro);
    EXPECT_EQ(ModeNames::find("B&W Spots Removal")->mode, Mode_SpotsRemoval);
    EXPECT_EQ(ModeNames::find("Auto Color")->mode, Mode_AutoColor);
    EXPECT_EQ(ModeNames::find("AutoColorFilter")->mode, Mode_AutoColorFilter);
    EXPECT_EQ(ModeNames::find("Batch"), nullptr);
    EXPECT_EQ(ModeNames::find(""), nullptr);
    for (const ModeDescription* mode : ModeNames::selectable())
        EXPECT_EQ(ModeNames::find(ModeNames::identifierOf(*mode)), mode);
    EXPECT_EQ(NearestNames::of("portret", ModeNames::identifiers()).front(), "Portrait");
    EXPECT_EQ(NearestNames::of("macropo", ModeNames::identifiers()).front(), "MacroPro");
}

TEST(SettingOptions, ShownNumbersBecomePositions) {
    // Position of a shown brightness v: 500 + v / 0.51; of a gamma v below 1: (v - 0.1) / 0.0018.
    EXPECT_NEAR(settled({.mode = "SmartBrightness", .value = "-51"}).Brightness2Value, 400, 1e-3);
    EXPECT_NEAR(settled({.mode = "SmartGamma", .value = "0.55"}).PerceptualGamma, 250, 1e-3);
    EXPECT_EQ(settled({.mode = "SmartGamma", .value = "10"}).PerceptualGamma, 1000);
    const CSliderParams levels =
        settled({.mode = "SmartLevels", .labelled = {{"Highlights", "204"}, {"Dark", "255"}}});
    EXPECT_NEAR(levels.PerceptualLight, 200, 1e-3);
    EXPECT_EQ(levels.PerceptualDark, 1000);
    EXPECT_TRUE(levels.PerceptualLightEnabled && levels.PerceptualDarkEnabled);
    EXPECT_FALSE(levels.PerceptualMiddleEnabled);
    const CSliderParams color = settled({.mode = "ColorFilter", .value = "40", .color = "1,20,255"});
    EXPECT_NEAR(color.mColor_Effect_Intensity_Value, 400, 1e-3);
    EXPECT_EQ(color.mColor_Value_G, 20);
    EXPECT_EQ(color.mColor_Value_B, 255);
}

TEST(SettingOptions, FieldsByNameOverrideTheMode) {
    EXPECT_EQ(settled({}).SaturationValue, 600); // Automatic
    const CSliderParams sliders =
        settled({.fields = {"SaturationValue=640.5,off", "mFade_Enabled=off", "mMoire_Value=1"}});
    EXPECT_EQ(sliders.SaturationValue, 640.5F);
    EXPECT_FALSE(sliders.SaturationEnabled || sliders.mFade_Enabled);
    EXPECT_EQ(sliders.mMoire_Value, 1);
    EXPECT_TRUE(sliders.Moire_Enabled); // as the mode has it
}

TEST(SettingOptions, FinalTouchRunsApartFromTheMode) {
    EXPECT_FALSE(settle({}).runsFinalTouch);
    const RunSettings run =
        settle({.color = "9,8,7", .finalTouch = "PercMiddleRGB=1,PercColorFilter=50,AbsShadowsR=51"});
    EXPECT_TRUE(run.runsFinalTouch);
    const CSliderParams& touch = run.finalTouchParams.mSliderParams;
    EXPECT_EQ(touch.mPerceptual_Touch_Middle_Value_RGB, 500);
    EXPECT_NEAR(touch.mDark_Touch_Value_R, 200, 1e-3);
    EXPECT_EQ(touch.mColor_Intensity_Touch_Value, 500);
    EXPECT_TRUE(touch.mColor_Touch_Enabled);
    EXPECT_EQ(touch.mColor_Touch_Value_B, 7);
    EXPECT_EQ(touch.SaturationValue, 0);
    EXPECT_FALSE(run.params.mSliderParams.mColor_Touch_Enabled);
    EXPECT_EQ(touch.mMiddle_Touch_Value_B, 500) << "neutral, as in the window";
}

// What the windows store when they are accepted.
void accept(EGUIMode mode, const CSliderParams& sliders) {
    SettingsEdit edit;
    PresetTree::write(edit, mode, PresetTree::batchPresetName(), PresetConversion::contentOf(mode, sliders));
    edit.set(PresetTree::batchModeKey(), mode);
    edit.commit();
}

TEST(SettingOptions, WhatWasAcceptedLastIsSettledAgain) {
    EXPECT_THROW(settleLast(), UsageError);
    const RunSettings landscape = settle({.mode = "LandscapePro", .fields = {"SaturationValue=123.5,on"}});
    accept(Mode_Advanced, landscape.params.mSliderParams);
    EXPECT_EQ(settleLast().params.mSliderParams.SaturationValue, 123.5F);
    EXPECT_EQ(settleLast().preset.text(), landscape.preset.text());
    EXPECT_FALSE(settleLast().runsFinalTouch);

    accept(Mode_FinalTouch, settle({.finalTouch = "PercMiddleRGB=1"}).finalTouchParams.mSliderParams);
    const RunSettings touch = settleLast(); // alone: what it goes on from was accepted apart
    EXPECT_EQ(touch.finalTouchParams.mSliderParams.mPerceptual_Touch_Middle_Value_RGB, 500);
    EXPECT_TRUE(touch.runsFinalTouch);
    EXPECT_FALSE(touch.params.mSliderParams.SaturationEnabled);

    SettingsEdit opened; // and closed again
    opened.set(PresetTree::batchModeKey(), Mode_SmartGamma);
    opened.commit();
    EXPECT_THROW(settleLast(), UsageError);
}

} // namespace
