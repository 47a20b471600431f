#include "Filters/CAverage.h"
#include "Filters/CBilinear.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "support/LogCapture.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

namespace {

using tasksettings::paramsFor;
using testplanes::at;
using testplanes::Pixel;
using P = CSliderParams;

bool apply(const char* task, CUserParams& params, CARGBPlane& plane) {
    CARGBPlane out(plane, QStringLiteral("out"));
    return tasksettings::run(task, params, plane, out);
}

Pixel colourAfter(const char* task, CUserParams& params, Pixel colour) {
    const auto plane = testplanes::uniform(5, 5, colour);
    EXPECT_TRUE(apply(task, params, *plane));
    return at(*plane, 4, 4);
}

double detail(CARGBPlane& plane) {
    CUserParams params;
    params.mSum_Color = 7;
    EXPECT_TRUE(apply("Sharp_Smart", params, plane));
    return params.mSum_Color;
}

TEST(SharpSmart, SumsTheDistancesToTheNeighbours) {
    EXPECT_EQ(detail(*testplanes::uniform(40, 30, {9, 8, 7})), 0);
    // Only the first pixel is sampled; three neighbours at a distance of 5, four pixels.
    const auto four = testplanes::make(2, 2, [](int x, int y) {
        return x + y == 0 ? Pixel{10, 20, 30} : Pixel{13, 24, 30};
    });
    EXPECT_EQ(detail(*four), 3.75);
    // From a width of 700 on every fifth column of the first row, one step in: 139 of them. Column 0 has two
    // neighbours that differ by 1, the others six; 7000 pixels.
    const auto stripes = testplanes::make(700, 10, [](int x, int) {
        return x % 5 == 0 ? Pixel{0, 0, 0} : Pixel{1, 0, 0};
    });
    EXPECT_NEAR(detail(*stripes), (2 + 4 * 138) / 7000.0, 1e-6);
}

TEST(SharpSmart, SumIsTheSameForEveryNumberOfThreads) {
    const auto plane = testplanes::noise(300, 200);
    double expected = 0;
    for (const int threads : {1, 2, 7, 7, 7}) {
        const orvela::RowScheduler scheduler(threads);
        const double sum = detail(*plane);
        expected = threads == 1 ? sum : expected;
        EXPECT_EQ(sum, expected) << threads;
    }
}

TEST(CBilinear, RunsOnNormalPicturesThatAreNotTooSharp) {
    const auto runs = [](CUserParams params, int side = 4) {
        return apply("CBilinear", params, *testplanes::uniform(side, side, {5, 5, 5}));
    };
    CUserParams params = paramsFor("CBilinear");
    params.Switch_TOO_SHARP = true;
    EXPECT_TRUE(runs(params)) << "decided anew";
    params.Normal_Picture = false;
    EXPECT_FALSE(runs(params));
    params.Normal_Picture = params.Switch_TOO_SHARP_ORV_I = params.Switch_TOO_SHARP_ORV_II = true;
    EXPECT_TRUE(runs(params));
    params.mSliderParams.OrvelaLevel3Enabled = true;
    EXPECT_FALSE(runs(params));

    params = CUserParams();
    params.mSliderParams.OrvelaLevel2Enabled = true;
    EXPECT_TRUE(runs(params, 701)) << "by itself after an iteration";
    EXPECT_FALSE(runs(params, 700));
    params.Switch_TOO_SHARP = true;
    EXPECT_FALSE(runs(params, 701));
}

TEST(CBilinear, LargePicturesTakeSixTenthsOfTheSlider) {
    const auto large = testplanes::noise(720, 700);
    const auto small = testplanes::make(9, 9, [&](int x, int y) { return at(*large, x, y); });
    CUserParams params = paramsFor("CBilinear", 500);
    ASSERT_TRUE(apply("CBilinear", params, *large));
    params.mSliderParams.BilinearFilteringValue = 300;
    ASSERT_TRUE(apply("CBilinear", params, *small));
    for (int i = 0; i < 8; ++i)
        EXPECT_EQ(at(*large, i, 4), at(*small, i, 4)) << i;
}

TEST(CBilinear, FlatAreasKeepEveryLevel) {
    CUserParams params = paramsFor("CBilinear");
    const auto patches = testplanes::make(768, 3, [](int x, int) {
        const auto level = static_cast<std::uint8_t>(x / 3);
        return Pixel{level, level, level};
    });
    ASSERT_TRUE(apply("CBilinear", params, *patches));
    for (int level = 0; level < 256; ++level)
        EXPECT_EQ(at(*patches, 3 * level + 1, 1)[1], level);
}

// Has memory for tables up to a size only.
struct StarvedBilinear final : CBilinear {
    using CBilinear::CBilinear;
    Floats allocate(std::size_t count) const override {
        return count > largest ? nullptr : CBilinear::allocate(count);
    }
    std::size_t largest = 0;
};

TEST(CBilinear, MissingMemoryIsReportedAndEndsTheFilter) {
    CUserParams params = paramsFor("CBilinear");
    const auto plane = testplanes::noise(5, 5);
    for (const std::string table : {"4 floats array (m_cBilinear)", "195076 floats array (m_sBilinear)"}) {
        const LogCapture log;
        StarvedBilinear filter(&params, plane.get(), plane.get());
        filter.largest = table[0] == '4' ? 3 : 195075;
        EXPECT_FALSE(filter.Apply());
        EXPECT_TRUE(log.has("Bilinear filter was unable to declare the " + table + "."));
    }
    EXPECT_EQ(ExceptionStack::oldestMessage(),
              "Bilinear filter was unable to declare the m_cBilinear floats array.");
    ExceptionStack::clear();
}

TEST(CMedianSaltPepper, BringsBrightSpotsToTheMedian) {
    CUserParams params = paramsFor("CMedian_Salt_Pepper", 500); // f = 1.05
    const auto after = [&params](std::uint8_t grey, Pixel middle) {
        const auto plane = testplanes::make(3, 3, [=](int x, int y) {
            return x == 1 && y == 1 ? middle : Pixel{grey, grey, grey};
        });
        EXPECT_TRUE(apply("CMedian_Salt_Pepper", params, *plane));
        return at(*plane, 1, 1);
    };
    EXPECT_EQ(after(100, {250, 200, 150}), (Pixel{125, 100, 75})) << "200 is above 125 * 1.05 = 131";
    EXPECT_EQ(after(20, {100, 100, 102}), (Pixel{100, 100, 102})) << "brightness 100 is never a spot";
    EXPECT_EQ(after(20, {101, 101, 101}), (Pixel{20, 20, 20}));
    // Mean 105.75 and 106, limit 111: strictly above.
    EXPECT_EQ(after(104, {111, 111, 112}), (Pixel{111, 111, 112}));
    EXPECT_EQ(after(104, {112, 112, 112}), (Pixel{104, 104, 104}));
    // Mean 131.25, limit 137; in pictures dark in the middle 65: 105 is a spot, raised by 420 / 315.
    EXPECT_EQ(after(140, {255, 50, 10}), (Pixel{255, 50, 10}));
    params.Dark_middle = true;
    EXPECT_EQ(after(140, {255, 50, 10}), (Pixel{254, 49, 9})) << "(340, 66, 13) rescaled by 254 / 340";
}

TEST(CMedianSaltPepper, MedianIsTheThirdSmallestOfTheWindow) {
    CUserParams params = paramsFor("CMedian_Salt_Pepper", 1000); // f = 0.1: every bright pixel
    std::array<std::uint8_t, 4> values = {40, 90, 150, 200};
    do {
        const auto plane = testplanes::make(3, 3, [&values](int x, int y) {
            const std::uint8_t v = values[static_cast<std::size_t>(2 * (y % 2) + x % 2)];
            return Pixel{v, v, v};
        });
        ASSERT_TRUE(apply("CMedian_Salt_Pepper", params, *plane));
        EXPECT_EQ(at(*plane, 1, 1)[0], values[3] > 100 ? 150 : values[3]);
    } while (std::next_permutation(values.begin(), values.end()));
}

TEST(CMoire, PutsTheHostPixelBackOnlyWhereAllChannelsDiffer) {
    CUserParams params = paramsFor("CMoire");
    const Pixel own = {100, 100, 100};
    for (const Pixel host : {Pixel{84, 116, 84}, {85, 0, 0}, {0, 115, 0}, {0, 0, 85}}) {
        const CARGBPlaneProxyDirect proxy(*testplanes::uniform(5, 5, host));
        EXPECT_EQ(colourAfter("CMoire", params, own), host[0] == 84 ? host : own);
    }
}

TEST(CClarity, BrightensAwayFromTheMean) {
    CUserParams params = paramsFor("CClarity", 0);
    params.m_OriginalLumaR = params.m_OriginalLumaG = params.m_OriginalLumaB = 100.9F;
    // T(10) = 10 exp(-10 / 8) = 2.87: 110 + 145 * 2.87 / 511 = 110.8
    EXPECT_EQ(colourAfter("CClarity", params, {110, 100, 90}), (Pixel{110, 100, 90}));
    params.mSliderParams.ClarityFilterValue = 1000;
    // T(10) = 9.98, sloper 100: 110 + 14.5; below the mean 511: 90 + 165 * 9.98 / 511 = 93.2
    EXPECT_EQ(colourAfter("CClarity", params, {110, 100, 90}), (Pixel{124, 100, 93}));
}

TEST(DetailFilters, StayAwayWhereOtherCorrectionsWork) {
    const auto plane = testplanes::uniform(3, 3, {9, 9, 9});
    const CARGBPlaneProxyDirect proxy(*plane);
    const auto staysAway = [&plane](const char* task, const std::vector<bool P::*>& sliders, bool P::*last) {
        CUserParams params = paramsFor(task);
        for (bool P::*slider : sliders)
            params.mSliderParams.*slider = true;
        EXPECT_TRUE(apply(task, params, *plane)) << task;
        params.mSliderParams.*last = !(params.mSliderParams.*last);
        EXPECT_FALSE(apply(task, params, *plane)) << task;
    };
    for (bool P::*slider :
         {&P::OrvelaLevelEnabled, &P::OrvelaLevel2Enabled, &P::ContrastEnabled, &P::BrightnessEnabled})
        staysAway("CMoire", {}, slider);
    staysAway(
        "CClarity",
        {&P::BilinearFilteringEnabled, &P::OrvelaLevelEnabled, &P::OrvelaLevel2Enabled, &P::mFade_Enabled},
        &P::SaturationEnabled);
    for (const auto& [task, flag] : {std::pair{"CMoire", &CUserParams::Switch_TOO_SHARP},
                                     {"CMoire", &CUserParams::Under_Exposed_Picture},
                                     {"CMedian_Salt_Pepper", &CUserParams::Switch_TOO_SHARP}}) {
        CUserParams params = paramsFor(task);
        params.*flag = true;
        EXPECT_FALSE(apply(task, params, *plane)) << task;
    }
    for (const char* task :
         {"CColor", "CTemperature", "Saturation", "CClarity", "CBilinear", "CMoire", "CMedian_Salt_Pepper"}) {
        CUserParams off;
        EXPECT_FALSE(apply(task, off, *plane)) << task;
    }
}

TEST(CAverage, LeavesThePicture) {
    CUserParams params;
    EXPECT_EQ(colourAfter("CAverage", params, {1, 2, 3}), (Pixel{1, 2, 3}));
    const auto plane = testplanes::noise(6, 5);
    EXPECT_FALSE(CAverage(&params, plane.get(), plane.get()).ApplyEmpty());
}

} // namespace
