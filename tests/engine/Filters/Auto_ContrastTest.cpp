#include "Filters/Auto_Contrast.h"

#include "StretchTestSupport.h"

using namespace orvela;

using namespace stretchtest;

TEST(Auto_Contrast, GeneratedPictures) {
    expectGenerated<Auto_Contrast>("Auto_Contrast", with({&P::AutoContrast_Enabled}));
    EXPECT_EQ(Auto_Contrast::normalCurve(128, {20, 235}), 127); // pulled to 118.04 and lifted to 127.30
    for (int v = 0; v < 256; ++v)
        EXPECT_TRUE(Auto_Contrast::normalCurve(v, {0, 255}) == v &&
                    Auto_Contrast::hazyCurve(v, {9, 9}) == 255);
}

TEST(Auto_Contrast, GivesWayToManualSettingsAndUnderExposure) {
    const auto runs = [](const U& params) {
        return applies<Auto_Contrast>(params, QStringLiteral("Filters/Auto_Contrast:325"));
    };
    U params = with({&P::AutoContrast_Enabled});
    EXPECT_TRUE(runs(params) && !runs(U()));
    for (bool P::*flag : {&P::Brightness2Enabled, &P::ContrastEnabled, &P::BrightnessEnabled})
        EXPECT_FALSE(runs(with({&P::AutoContrast_Enabled, flag})));
    params.Under_Exposed_Picture = true;
    EXPECT_FALSE(runs(params));
}

TEST(Auto_Contrast, StaysAwayFromAPictureThatLacksAColour) {
    for (float U::*mean : {&U::m_OriginalLumaR, &U::m_OriginalLumaG, &U::m_OriginalLumaB}) {
        for (const float value : {50.0F, 49.0F}) {
            U params = with({&P::AutoContrast_Enabled});
            params.m_OriginalLumaR = params.m_OriginalLumaB = 100;
            params.m_OriginalLumaG = 110;
            params.*mean = value;
            EXPECT_EQ(apply<Auto_Contrast>(params, *uniform(2, 2, {90, 90, 90})), value == 50);
            EXPECT_EQ(params.Bicromic, value == 49);
        }
    }
}

TEST(Auto_Contrast, BaseThresholdBeginsAboveASideOf700) {
    EXPECT_EQ(TonalStretch::baseThreshold(490000), 0);
    EXPECT_NEAR(TonalStretch::baseThreshold(490001), 70.00007, 1e-5);
}

// By red alone: bins above 100 samples at first. Green ends its left scan at 254, blue its right one at 2.
TEST(Auto_Contrast, ScansOfALargePicture) {
    for (const float luma : {127.0F, 128.0F}) {
        U params = with({&P::AutoContrast_Enabled});
        params.Shift_Level = 7;
        params.m_OriginalLuma = luma;
        params.pHisto_Red[10] = params.pHisto_Red[240] = 100;
        params.pHisto_Red[20] = params.pHisto_Red[230] = 101;
        params.pHisto_Red[40] = 1500;
        params.pHisto_Green[255] = params.pHisto_Blue[1] = 5000;
        const LogCapture log;
        ASSERT_TRUE(apply<Auto_Contrast>(params, *uniform(1000, 1000, {128, 0, 255})));
        for (const char* line : {"i= C_Red_Left_limit:20 20.000000", "i= C_Red_Right_limit:230 230.000000",
                                 "i= C_Green_Right_limit:255 255.000000", "i=  C_Blue_Left_limit:1 1.000000",
                                 luma < 128 ? "threshold: 2000.000000 " : "threshold: 1000.000000 "})
            EXPECT_TRUE(log.has(line)) << line;
        EXPECT_EQ(log.has("i= C_Red_Left_limit:40 40.000000"), luma == 128);
        EXPECT_FALSE(log.has("i= C_Green_Left_limit:255 255.000000"));
        EXPECT_FALSE(log.has("i=  C_Blue_Right_limit:1 1.000000"));
    }
}
