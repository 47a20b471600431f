#include "command/SettingOptions.h"

#include "ProgramRun.h"
#include "command/ExitStatus.h"
#include "command/ModeNames.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

using namespace orvela;

namespace {

std::string refusal(const SettingOptions& options) {
    try {
        settle(options);
    } catch (const UsageError& error) {
        return error.what();
    }
    return {};
}

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
    EXPECT_EQ(ModeNames::nearest("portret").front(), "Portrait");
    EXPECT_EQ(ModeNames::nearest("macropo").front(), "MacroPro");
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

TEST(SettingOptions, WhatIsOutOfRangeIsRefusedWithTheRange) {
    const auto says = [](const SettingOptions& options, const char* text) {
        return refusal(options).find(text) != std::string::npos;
    };
    EXPECT_TRUE(says({.mode = "Temperature", .value = "1999"}, "from 2000 to 10000"));
    EXPECT_TRUE(says({.mode = "Temperature", .value = "nan"}, "from 2000 to 10000"));
    EXPECT_TRUE(says({.mode = "Temperature", .value = "3000K"}, "from 2000 to 10000"));
    EXPECT_TRUE(says({.mode = "SmartLevels", .labelled = {{"Highlights", "256"}}}, "from 0 to 255"));
    EXPECT_TRUE(says({.mode = "SmartLevels", .labelled = {{"Saturation", "1"}}}, "--middle, --dark"));
    EXPECT_TRUE(says({.mode = "SmartLevels"}, "at least one of"));
    EXPECT_TRUE(says({.mode = "Portrait", .value = "1"}, "one slider"));
    EXPECT_TRUE(says({.mode = "ColorFilter", .color = "1,2"}, "three numbers"));
    EXPECT_TRUE(says({.mode = "ColorFilter", .color = "1,2,256"}, "from 0 to 255"));
    EXPECT_TRUE(says({.color = "1,2,3"}, "needs a colour filter"));
    EXPECT_TRUE(says({.fields = {"SaturationValue=1001"}}, "from 0 to 1000"));
    EXPECT_TRUE(says({.fields = {"SaturationValue=1,maybe"}}, "on or off"));
    EXPECT_TRUE(says({.fields = {"mColor_Value_R=1,on"}}, "has no switch"));
    EXPECT_TRUE(says({.fields = {"Saturation=1"}}, "no setting"));
    EXPECT_TRUE(says({.fields = {"SaturationValue"}}, "NAME=VALUE"));
    EXPECT_TRUE(says({.finalTouch = "AbsContrast=101"}, "from -100 to 100"));
    EXPECT_TRUE(says({.finalTouch = "Contrast=1"}, "AbsContrast, PercContrast"));
}

class SettingCommandTest : public ProgramTest {};

TEST_F(SettingCommandTest, EveryModeIsListedWithItsSliders) {
    const Answer json = orvela("modes --json");
    ASSERT_EQ(json.status, 0);
    const QJsonArray modes =
        QJsonDocument::fromJson(QByteArray::fromStdString(json.out)).object()["modes"].toArray();
    ASSERT_EQ(modes.size(), 12 + 1 + 14 + 2); // automatic, Advanced, one slider, three sliders
    const QJsonObject levels = modes[27].toObject();
    EXPECT_EQ(levels["identifier"], "SmartLevels");
    EXPECT_EQ(levels["sliders"].toArray()[0].toObject()["option"], "--highlights");
    EXPECT_EQ(levels["sliders"].toArray()[0].toObject()["high"], 255);
    EXPECT_TRUE(levels["sliders"].toArray()[0].toObject()["help"].toString().startsWith("Brightens"));
    const Answer text = orvela("modes");
    EXPECT_TRUE(text.says("Temperature: ") && text.says("Temperature, 2000 to 10000"));
    EXPECT_TRUE(text.says("Makes the light warmer"));
}

} // namespace
