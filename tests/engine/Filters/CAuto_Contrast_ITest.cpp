#include "Filters/CAuto_Contrast_I.h"

#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "StretchTestSupport.h"

using namespace orvela;

using namespace stretchtest;

namespace {

// What becomes of a pixel, both iterations on at `level`, with the means `after` them against those before.
Pixel balanced(Pixel pixel, std::array<float, 3> before, std::array<float, 3> after, float fade = 0,
               float level = 0, float light = 65) {
    U params = with({&P::OrvelaLevelEnabled, &P::OrvelaLevel2Enabled});
    params.mSliderParams.mFade_Value = fade;
    params.mSliderParams.OrvelaLevelValue = params.mSliderParams.OrvelaLevel2Value = level;
    std::tie(params.m_OriginalLumaR0, params.m_OriginalLumaG0, params.m_OriginalLumaB0) =
        std::tuple_cat(before);
    std::tie(params.m_OriginalLumaR, params.m_OriginalLumaG, params.m_OriginalLumaB) = std::tuple_cat(after);
    params.m_OriginalLuma = 110;
    params.m_Light_Acu = 0.25;
    params.OrvelaLight1 = params.OrvelaLight2 = light;
    const auto plane = uniform(1, 1, pixel);
    EXPECT_TRUE(apply<CAuto_Contrast_I>(params, *plane));
    return at(*plane, 0, 0);
}

} // namespace

TEST(CAuto_Contrast_I, FollowsTheIterations) {
    const CARGBPlaneProxyDirect host(*uniform(1, 1, {0, 0, 0}));
    const auto runs = [](bool P::*flag, std::initializer_list<bool U::*> changed) {
        U params = with({flag});
        for (bool U::*each : changed)
            params.*each = !(params.*each);
        return applies<CAuto_Contrast_I>(params, QStringLiteral("Filters/CAuto_Contrast_I:171"));
    };
    EXPECT_FALSE(runs(&P::mFade_Enabled, {}));
    EXPECT_TRUE(runs(&P::OrvelaLevel2Enabled, {&U::Switch_TOO_SHARP_ORV_I}));
    EXPECT_TRUE(runs(&P::OrvelaLevelEnabled, {&U::Switch_TOO_SHARP_ORV_II}));
    EXPECT_FALSE(runs(&P::OrvelaLevelEnabled, {&U::Switch_TOO_SHARP_ORV_I, &U::Switch_TOO_SHARP_ORV_II}));
    EXPECT_FALSE(runs(&P::OrvelaLevelEnabled, {&U::Normal_Picture}));
    EXPECT_FALSE(runs(&P::OrvelaLevelEnabled, {&U::Under_Exposed_Picture}));
}

// Light 65 is not above 65: factor 1. At 66 it is (1.0631 - 0.25 * 0.4025) * 132 * 0.45 = 57.171.
TEST(CAuto_Contrast_I, RatiosAreNormalisedWhenAllGrewAndOneMeanIsBright) {
    const CARGBPlaneProxyDirect host(*uniform(1, 1, {0, 0, 0}));
    const Pixel pixel = {100, 2, 2};
    const std::array after = {128.0F, 80.0F, 100.0F};
    EXPECT_EQ(balanced(pixel, {150, 120, 110}, after), (Pixel{108, 2, 2})); // 1.080346, 1.382843, 1.014085
    EXPECT_EQ(balanced(pixel, {150, 120, 110}, after, 0, 0, 66), (Pixel{254, 6, 4})); // 6176, 158, 115
    EXPECT_EQ(balanced(pixel, {150, 120, 100}, after), (Pixel{117, 3, 2})) << "blue stayed";
    EXPECT_EQ(balanced(pixel, {255, 120, 150}, {127.5, 80, 100}), (Pixel{200, 3, 3})) << "not bright";
    EXPECT_EQ(balanced(pixel, {2, 120, 150}, {0, 80, 100}), (Pixel{200, 3, 3})) << "denominator 1";
}

// The host's share is 0.5 * 0.99102 * 1.1 = 0.54506; levels above 268 add to it, at 1000 0.1 each to 1.1.
TEST(CAuto_Contrast_I, FadesTowardTheHostsPixel) {
    constexpr std::array kSame = {9.0F, 9.0F, 9.0F};
    const CARGBPlaneProxyDirect host(*uniform(1, 1, {100, 187, 255}));
    EXPECT_EQ(balanced({0, 0, 255}, kSame, kSame, 500, 268), (Pixel{54, 101, 255}));
    EXPECT_EQ(balanced({0, 0, 255}, kSame, kSame, 500, 1000), (Pixel{64, 120, 255}));
    EXPECT_EQ(balanced({0, 9, 7}, kSame, kSame, 1000), (Pixel{100, 187, 255}));
    for (float fade = 0; fade <= 1000; fade += 7)
        EXPECT_EQ(balanced({100, 187, 255}, kSame, kSame, fade), (Pixel{100, 187, 255})) << fade;
    EXPECT_FLOAT_EQ(CAuto_Contrast_I::sharpnessFactor(1500, 1500), 0.75F);
    EXPECT_FLOAT_EQ(CAuto_Contrast_I::sharpnessFactor(750, 750), 0.9403985F);
}
