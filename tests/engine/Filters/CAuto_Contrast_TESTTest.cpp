#include "Filters/CAuto_Contrast_TEST.h"

#include "StretchTestSupport.h"

using namespace orvela;

using namespace stretchtest;

TEST(CAuto_Contrast_TEST, GeneratedAndHazyPictures) {
    expectGenerated<CAuto_Contrast_TEST>("CAuto_Contrast_TEST", with({&P::ContrastEnabled}));
    expectHazyStretch<CAuto_Contrast_TEST>(with({&P::ContrastEnabled}));
}

TEST(CAuto_Contrast_TEST, StaysAwayFromThePurelyAutomaticSituation) {
    const auto runs = [](const U& params) {
        return applies<CAuto_Contrast_TEST>(params, QStringLiteral("Filters/CAuto_Contrast_TEST:315"));
    };
    for (bool P::*flag : {&P::AutoContrast_Enabled, &P::PerceptualLightEnabled, &P::OrvelaLevel2Enabled,
                          &P::ClarityFilterEnabled, &P::mAbsolute_Middle_Enabled, &P::GammaCorrectionEnabled})
        EXPECT_TRUE(runs(with({flag})) && !runs(with({flag, &P::mAuto_Color_Enabled})));
    U params = with(kAutomatic);
    EXPECT_FALSE(runs(params) || runs(U()));
    params.Under_Exposed_Picture = true;
    EXPECT_TRUE(runs(params));
    params.Under_Exposed_Picture = params.Normal_Picture = false;
    EXPECT_TRUE(runs(params));
}

// L = 20, R = 100, k = 3.1875: the odd pixel becomes 733, 255, 15 and is scaled by 254 / 733.
TEST(CAuto_Contrast_TEST, KeepsTheHueAboveTheLimitAndPixelsBelow) {
    for (const std::uint8_t blue : {25, 19}) {
        U params = with({&P::ContrastEnabled});
        const auto plane = halves({20, 20, 20}, {100, 100, 100}, {250, 100, blue}, 1);
        ASSERT_TRUE(apply<CAuto_Contrast_TEST>(params, *plane));
        EXPECT_EQ(at(*plane, 0, 0), blue == 25 ? (Pixel{254, 88, 5}) : (Pixel{250, 100, 19}));
        EXPECT_EQ(at(*plane, 1, 0), (Pixel{0, 0, 0}));
        EXPECT_EQ(params.pHisto_Red[250], 9);
    }
}

// The left scans end at 253, the right ones at 2.
TEST(CAuto_Contrast_TEST, ExtremeBinsSetNoChannelLimit) {
    U params = with({&P::ContrastEnabled});
    const auto light = uniform(4, 4, {254, 254, 254}); // 0 and 254: the factor is 255 / 254
    ASSERT_TRUE(apply<CAuto_Contrast_TEST>(params, *light));
    EXPECT_EQ(at(*light, 0, 0), (Pixel{255, 255, 255}));
    const auto dark = testplanes::make(4, 4, [](int x, int) { return x ? Pixel{1, 1, 1} : Pixel{}; });
    ASSERT_TRUE(apply<CAuto_Contrast_TEST>(params, *dark));
    EXPECT_EQ(at(*dark, 3, 0), (Pixel{1, 1, 1})); // 0 and 255
}
