#include "Filters/CBilinear.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
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

TEST(CBilinear, RunsOnNormalPicturesThatAreNotTooSharp) {
    const std::string on = "BilinearFilteringEnabled BilinearFilteringValue=700 ";
    const std::string sharp = on + "Switch_TOO_SHARP_ORV_I Switch_TOO_SHARP_ORV_II ";
    const std::tuple<std::string, int, bool> cases[] = {
        {on + "Switch_TOO_SHARP", 4, true}, // decided anew
        {on + "Normal_Picture=0", 4, false},
        {sharp, 4, true},
        {sharp + "OrvelaLevel3Enabled", 4, false},
        {"OrvelaLevel2Enabled", 701, true}, // by itself after an iteration
        {"OrvelaLevel2Enabled", 700, false},
        {"OrvelaLevel2Enabled Switch_TOO_SHARP", 701, false}};
    for (const auto& [settings, side, runs] : cases) {
        CUserParams params = paramsFrom(settings);
        EXPECT_EQ(apply("CBilinear", params, *testplanes::uniform(side, side, {5, 5, 5})), runs) << settings;
    }
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
        StarvedBilinear filter({}, &params, plane.get(), plane.get());
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

TEST(DetailFilters, StayAwayWhereOtherCorrectionsWork) {
    const auto plane = testplanes::uniform(3, 3, {9, 9, 9});
    const CARGBPlaneProxyDirect proxy(*plane);
    const std::array<const char*, 3> cases[] = {
        {"CMoire", "Moire_Enabled",
         "OrvelaLevelEnabled OrvelaLevel2Enabled ContrastEnabled BrightnessEnabled Switch_TOO_SHARP "
         "Under_Exposed_Picture"},
        {"CMedian_Salt_Pepper", "SaltPepperEnabled", "Switch_TOO_SHARP"},
        {"CClarity",
         "ClarityFilterEnabled BilinearFilteringEnabled OrvelaLevelEnabled OrvelaLevel2Enabled mFade_Enabled",
         "SaturationEnabled"}};
    for (const auto& [task, settings, others] : cases) {
        CUserParams params = paramsFrom(settings);
        EXPECT_TRUE(apply(task, params, *plane)) << task;
        for (const QString& other : QString(others).split(' ')) {
            params = paramsFrom(settings);
            setField(params, other, 1);
            EXPECT_FALSE(apply(task, params, *plane)) << task << ' ' << other.toStdString();
        }
    }
}

} // namespace
