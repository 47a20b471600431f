#include "Histograms/CHistogram_III.h"

#include "Histograms/CHistogram_IV.h"
#include "Histograms/CHistogram_Luma_Final.h"
#include "Histograms/CHistogram_VII.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

template <typename Task>
CUserParams measure(CARGBPlane& plane, bool bicromic = false) {
    CUserParams params;
    params.mSliderParams.mAuto_Color_Enabled = true;
    params.Bicromic = bicromic;
    EXPECT_TRUE(Task({}, &params, &plane).Apply());
    return params;
}

// Whether the means raise the cast flag; 40000 of 40401 pixels are sampled, so a sample is one above its
// mean.
template <typename Task>
bool cast(int red, int green, int blue, bool before = false) {
    const auto sample = [](int mean) { return static_cast<std::uint8_t>(mean == 0 ? 0 : mean + 1); };
    const auto plane = testplanes::uniform(201, 201, {sample(red), sample(green), sample(blue)});
    const CUserParams params = measure<Task>(*plane, before);
    EXPECT_EQ(params.m_OriginalLumaR, red);
    EXPECT_EQ(params.m_OriginalLumaG, green);
    EXPECT_EQ(params.m_OriginalLumaB, blue);
    return params.Bicromic;
}

template <typename Task>
void expectBandAverages() {
    const int lumas[] = {0, 1, 85, 85, 86, 170, 171, 255, 255};
    const auto plane = testplanes::make(10, 2, [&lumas](int x, int) {
        const auto v = static_cast<std::uint8_t>(x < 9 ? lumas[x] : 100);
        return testplanes::Pixel{v, v, v};
    });
    const CUserParams params = measure<Task>(*plane);
    EXPECT_EQ(params.Dark_Ave, 57);    // (1 + 85 + 85) / 3
    EXPECT_EQ(params.Middle_Ave, 128); // (86 + 170) / 2
    EXPECT_EQ(params.Light_Ave, 227);  // (171 + 255 + 255) / 3
    const auto black = testplanes::uniform(9, 9, {0, 0, 0});
    const CUserParams empty = measure<Task>(*black);
    EXPECT_EQ(empty.Dark_Ave + empty.Middle_Ave + empty.Light_Ave, 0);
}

} // namespace

TEST(CHistogram_III, AveragesTheBands) {
    expectBandAverages<CHistogram_III>();
    expectBandAverages<CHistogram_IV>();
}

TEST(CHistogram_III, CastNeedsAMeanBelowHalfOrAQuarter) {
    for (const auto& [low, half, quarter] : {std::array{45, 0, 0}, {44, 1, 0}, {23, 1, 0}, {22, 1, 1}}) {
        EXPECT_EQ(cast<CHistogram_III>(90, 90, low), half) << low;
        EXPECT_EQ(cast<CHistogram_III>(90, low, 90), half) << low;
        EXPECT_EQ(cast<CHistogram_III>(low, 90, 90), half) << low;
        EXPECT_EQ(cast<CHistogram_IV>(90, low, 90), quarter) << low;
    }
    EXPECT_FALSE(cast<CHistogram_III>(90, 40, 50));
    EXPECT_FALSE(cast<CHistogram_IV>(88, 88, 22));
    EXPECT_TRUE(cast<CHistogram_III>(50, 50, 50, true));
}

TEST(CHistogram_VII, EveryPictureButBlackCountsAsCastOrBalanced) {
    EXPECT_FALSE(cast<CHistogram_VII>(0, 0, 0));
    for (const std::array<int, 3> means :
         {std::array{1, 0, 0}, {0, 90, 0}, {0, 0, 9}, {70, 50, 80}, {90, 90, 20}})
        EXPECT_TRUE(cast<CHistogram_VII>(means[0], means[1], means[2]));
}

TEST(CHistogram_Luma_Final, CountsEveryPixelUnscaled) {
    const auto plane = testplanes::make(1200, 3, [](int x, int) {
        return x == 1199 ? testplanes::Pixel{0, 200, 100} : testplanes::Pixel{60, 61, 61};
    });
    const CUserParams params = measure<CHistogram_Luma_Final>(*plane);
    EXPECT_EQ(params.pHisto_Luma[60], 3 * 1199);
    EXPECT_EQ(params.pHisto_Luma[100], 3);
    EXPECT_EQ(params.pHisto_Red[0] + params.pHisto_Green[200] + params.pHisto_Blue[100], 9);
    EXPECT_EQ(params.m_OriginalLuma, 60); // 60.03
    EXPECT_EQ(params.m_OriginalLumaR, 0);
}
