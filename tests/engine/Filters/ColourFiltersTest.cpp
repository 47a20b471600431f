#include "support/LogCapture.h"
#include "support/ParamsText.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

using tasksettings::apply;
using tasksettings::colourAfter;
using tasksettings::paramsFor;
using testplanes::at;
using testplanes::Pixel;

CUserParams tint(float intensity, Pixel colour) {
    CUserParams params = paramsFor("CColor", intensity);
    params.mSliderParams.mColor_Value_R = colour[0];
    params.mSliderParams.mColor_Value_G = colour[1];
    params.mSliderParams.mColor_Value_B = colour[2];
    return params;
}

TEST(CColor, TintsAndRestoresTheMeanBrightness) {
    CUserParams params = tint(500, {200, 100, 50});
    // (150, 100, 75) with mean 108.33, times 100 / 108.33
    EXPECT_EQ(colourAfter("CColor", params, {100, 100, 100}), (Pixel{138, 92, 69}));
    params = tint(0, {200, 100, 50});
    EXPECT_EQ(colourAfter("CColor", params, {10, 20, 30}), (Pixel{10, 20, 30}));
    EXPECT_EQ(colourAfter("CColor", params, {10, 10, 11}), (Pixel{9, 9, 10})) << "10 / 10.333, truncated";
    params = tint(1000, {255, 51, 0});
    // mean 102: times 200 / 102 = (500, 100, 0), so 100 * 254 / 500 = 50.8
    EXPECT_EQ(colourAfter("CColor", params, {200, 200, 200}), (Pixel{254, 50, 0}));
    params = tint(1000, {0, 0, 0});
    EXPECT_EQ(colourAfter("CColor", params, {90, 80, 70}), (Pixel{0, 0, 0}));
}

TEST(CColor, FinalTouchHasItsOwnColourAndIntensity) {
    CUserParams params =
        paramsFrom("mColor_Effect_Intensity_Value=1000 mColor_Value_R=255 mColor_Touch_Enabled "
                   "mColor_Intensity_Touch_Value=500 mColor_Touch_Value_B=100");
    EXPECT_EQ(colourAfter("CColor", params, {60, 60, 60}), (Pixel{180, 0, 0})) << "either switch starts it";
    params.Final_Touch_Mode_Enabled = true;
    // (30, 30, 80) with mean 46.67, times 60 / 46.67
    EXPECT_EQ(colourAfter("CColor", params, {60, 60, 60}), (Pixel{38, 38, 102}));
}

TEST(Saturation, RestoresTheUnprocessedBrightnessAfterAnIteration) {
    const std::string second = "OrvelaLevel2Enabled ";
    const std::string both = second + "OrvelaLevelEnabled BilinearFilteringEnabled ";
    const std::pair<std::string, int> cases[] = {
        {"", 100},
        {second + "Switch_TOO_SHARP", 100},
        {second + "Normal_Picture=0", 100},
        {second + "Under_Exposed_Picture", 100},
        {both, 50},
        {both + "mFade_Enabled", 100}}; // the automatic situation keeps the picture's own
    for (const auto& [settings, grey] : cases) {
        CUserParams params =
            paramsFrom("SaturationEnabled SaturationValue=500 m_OriginalLuma0=50 " + settings);
        const auto plane = testplanes::uniform(20, 20, {100, 100, 100});
        EXPECT_TRUE(apply("Saturation", params, *plane));
        EXPECT_EQ(at(*plane, 19, 19)[0], grey) << settings;
    }
}

TEST(Saturation, UndefinedRatiosAndSlopesChangeNothing) {
    CUserParams params = paramsFor("Saturation", 550);
    const LogCapture log;
    EXPECT_TRUE(apply("Saturation", params, *testplanes::uniform(20, 20, {0, 0, 0})));
    EXPECT_TRUE(log.has(" Saturation Radion_iso_Luma 1.000000"));
    // The samples see red only; between them green and blue stand at the largest mean.
    const auto red = testplanes::make(20, 20, [](int x, int y) {
        return x % 5 + y % 5 == 0 ? Pixel{200, 0, 0} : Pixel{5, 200, 200};
    });
    EXPECT_TRUE(apply("Saturation", params, *red));
    EXPECT_EQ(at(*red, 6, 6), (Pixel{5, 200, 200}));
}

// Channel values from a few lines of another language.
TEST(CTemperature, ShiftsTheBalanceByIntervalAndLeavesDarkPixels) {
    CUserParams params = paramsFor("CTemperature", 0);
    EXPECT_EQ(colourAfter("CTemperature", params, {30, 40, 20}), (Pixel{30, 40, 20}));
    EXPECT_EQ(colourAfter("CTemperature", params, {30, 30, 31}), (Pixel{32, 30, 27}));
    EXPECT_EQ(colourAfter("CTemperature", params, {250, 240, 245}), (Pixel{254, 182, 154}));
    params = paramsFor("CTemperature", 250); // 4000 K belongs to the interval that it ends
    EXPECT_EQ(colourAfter("CTemperature", params, {120, 100, 80}), (Pixel{123, 100, 76}));
    params = paramsFor("CTemperature", 250.25F);
    EXPECT_EQ(colourAfter("CTemperature", params, {120, 100, 80}), (Pixel{120, 99, 79}));
    params = paramsFor("CTemperature", 1000);
    EXPECT_EQ(colourAfter("CTemperature", params, {250, 240, 245}), (Pixel{215, 226, 254}));
}

} // namespace
