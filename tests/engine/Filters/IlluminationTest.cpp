#include "Filters/COrv_II_Iter.h"
#include "Filters/COrv_I_Iter.h"
#include "Filters/Super_ORV.h"
#include "Filters/Super_ORV_II.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/ParamsText.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

using testplanes::at;
using testplanes::bytes;
using testplanes::Pixel;

template <typename Filter>
bool apply(CUserParams& params, CARGBPlane& plane) {
    CARGBPlane out(plane, QStringLiteral("out"));
    return Filter({}, &params, &plane, &out).Apply();
}

// Only an iteration, by the name of its slider, is on.
CUserParams level(const std::string& name, float value) {
    return paramsFrom(name + "Enabled " + name + "Value=" + std::to_string(value));
}

// floor(100 * (1 + tanh(100 * k / 380 - 2)) / 1.44), worked out by a few lines of another language.
TEST(IlluminationIteration, FlatAreasFollowTheSlider) {
    struct Case {
        float slider;
        int first;
        int second;
    };
    // Grey 100: window sum trunc(379.2134) = 379, k = 3.792134 * 255 / epsilon.
    for (const Case& expected : {Case{0, 130, 137}, Case{500, 85, 116}, Case{750, 61, 95}}) {
        for (const bool first : {true, false}) {
            CUserParams params =
                first ? level("OrvelaLevel", expected.slider) : level("OrvelaLevel2", expected.slider);
            const auto plane = testplanes::uniform(6, 6, {100, 100, 100});
            ASSERT_TRUE(first ? apply<COrv_I_Iter>(params, *plane) : apply<COrv_II_Iter>(params, *plane));
            EXPECT_EQ(at(*plane, 3, 3)[0], first ? expected.first : expected.second) << expected.slider;
        }
    }
}

TEST(IlluminationIteration, CoefficientsAreTruncatedAsDefined) {
    CUserParams params = level("OrvelaLevel", 1000); // 61 * 0.85 = 51.85
    apply<COrv_I_Iter>(params, *testplanes::uniform(2, 2, {1, 1, 1}));
    EXPECT_EQ(params.OrvelaLight1, 51);
    EXPECT_TRUE(params.Soft_Orvela) << "51 / 0.85 = 60 is not above 70";
    params = level("OrvelaLevel2", 500); // 45.5, 45 / 1.275 = 35.29
    apply<COrv_II_Iter>(params, *testplanes::uniform(2, 2, {1, 1, 1}));
    EXPECT_EQ(params.OrvelaLight2, 35);
}

TEST(IlluminationIteration, BrightResultsAreClampedAndEmptyWindowsDarken) {
    CUserParams params = level("OrvelaLevel", 0);
    auto plane = testplanes::uniform(4, 4, {200, 200, 200});
    apply<COrv_I_Iter>(params, *plane);
    EXPECT_EQ(at(*plane, 2, 2), (Pixel{255, 255, 255})) << "200 * 1.886 / 1.44 = 261.9";
    plane = testplanes::uniform(1, 9, {200, 100, 50});
    apply<COrv_I_Iter>(params, *plane);
    // An empty window leaves the gain 1 + tanh(-2) = 0.035972: 200 * 0.035972 / 1.44 = 4.996.
    EXPECT_EQ(at(*plane, 0, 4), (Pixel{4, 2, 1}));
}

// The last column's window holds only its left neighbours: a bright last column there is not its own
// surround.
TEST(IlluminationIteration, LastColumnAndRowAreNotTheirOwnSurround) {
    CUserParams params = level("OrvelaLevel", 500);
    const auto plane = testplanes::make(5, 5, [](int x, int) {
        return x == 4 ? Pixel{90, 90, 90} : Pixel{30, 30, 30};
    });
    apply<COrv_I_Iter>(params, *plane);
    // Column 4, row 2: W = 0.946905 + 0.898324, S = trunc(30 * W) = 55, k = W * 255 / 114,
    // r = 90 * 4.127486 / 56 - 2 = 4.6335, gain 1.99981, 90 * 1.99981 / 1.44 = 124.988.
    EXPECT_EQ(at(*plane, 4, 2)[0], 124);
}

TEST(IlluminationIteration, ColourDetailGuardsAreStrict) {
    const std::string first = "OrvelaLevelEnabled OrvelaLevelValue=500 ";
    const std::string detailed = first + "OrvelaLevel3Enabled ";
    const std::string automatic = detailed + "mAuto_Color_Enabled ";
    const std::string perceptual = "PerceptualDarkEnabled PerceptualMiddleEnabled mSum_Color=9 ";
    const std::string second = "OrvelaLevel2Enabled OrvelaLevel3Enabled AutoContrast_Enabled ";
    const std::vector<std::pair<std::string, bool>> cases = {
        {automatic + "mSum_Color=2.18", true},
        {automatic + "mSum_Color=2.19", false},
        {automatic + "mSum_Color=0.25", true},
        {automatic + "mSum_Color=0.24", false},
        {detailed + "mSum_Color=9", true},
        {detailed + perceptual, true},
        {detailed + perceptual + "PerceptualLightEnabled", false},
        {first + perceptual + "PerceptualLightEnabled", true},
        {second + "mSum_Color=0.7", true},
        {second + "mSum_Color=0.69", false}};
    const auto plane = testplanes::uniform(3, 3, {9, 9, 9});
    for (const auto& [settings, runs] : cases) {
        const bool one = settings.starts_with(first);
        CUserParams params = paramsFrom(settings);
        bool& sharp = one ? params.Switch_TOO_SHARP_ORV_I : params.Switch_TOO_SHARP_ORV_II;
        sharp = runs; // decided anew
        EXPECT_EQ(one ? apply<COrv_I_Iter>(params, *plane) : apply<COrv_II_Iter>(params, *plane), runs)
            << settings;
        EXPECT_EQ(sharp, !runs) << settings;
    }
    CUserParams params = paramsFrom(first + "Under_Exposed_Picture mSum_Color=1");
    EXPECT_FALSE(apply<COrv_I_Iter>(params, *plane));
}

TEST(Super_ORV, SmoothsFlatAreasInsideTheBorderOnly) {
    CUserParams params = level("OrvelaLevel3", 100);
    const auto plane = testplanes::uniform(9, 8, {200, 100, 10});
    EXPECT_TRUE(apply<Super_ORV>(params, *plane));
    // 19.624 / 20 of the value: 196.2, 98.1, 9.8.
    for (int y = 0; y < 8; ++y) {
        for (int x = 0; x < 9; ++x) {
            const bool inside = x >= 3 && x < 6 && y >= 3 && y < 5;
            EXPECT_EQ(at(*plane, x, y), inside ? (Pixel{196, 98, 9}) : (Pixel{200, 100, 10}))
                << x << ',' << y;
        }
    }
    EXPECT_FALSE(apply<Super_ORV>(params, *testplanes::noise(4, 100)));
}

TEST(Super_ORV, ThresholdIsStrictAndBlackIsLeftAlone) {
    // One differing pixel: D = 40 (only red differs by 40), M = 24 * 300 + 340 = 7540, D / (M / 3) =
    // 0.015915. The threshold is never below 0.05; a difference of 150 gives 150 / (7650 / 3) = 0.058824,
    // above 0.05 and below 0.06.
    const auto spot = [](int dx) {
        return testplanes::make(7, 7, [dx](int x, int y) {
            return x == 3 && y == 4 ? Pixel{static_cast<std::uint8_t>(100 + dx), 100, 100}
                                    : Pixel{100, 100, 100};
        });
    };
    const auto smoothed = [&](float slider, int dx) {
        CUserParams params = level("OrvelaLevel3", slider);
        const auto plane = spot(dx);
        apply<Super_ORV>(params, *plane);
        return at(*plane, 3, 3)[1] == 98;
    };
    EXPECT_TRUE(smoothed(0, 40));
    EXPECT_FALSE(smoothed(0, 150));
    EXPECT_TRUE(smoothed(34, 150)) << "0.05 + 0.0102 = 0.0602";
    CUserParams params = level("OrvelaLevel3", 1000);
    const auto black = testplanes::uniform(7, 7, {0, 0, 0});
    apply<Super_ORV>(params, *black);
    EXPECT_EQ(at(*black, 3, 3), (Pixel{0, 0, 0}));
}

TEST(Super_ORV, WeighsEveryClassOfDistance) {
    // A single pixel of 100 more at each place around the centre changes the average by 100 * weight / 20;
    // the centre itself would be an edge against all others.
    const double weights[] = {1.38889, 1.18353, 1.00854, 0, 0.73235, 0.62407, 0, 0, 0.38616};
    for (int dy = -2; dy <= 2; ++dy) {
        for (int dx = -2; dx <= 2; ++dx) {
            if (dx == 0 && dy == 0)
                continue;
            CUserParams params = level("OrvelaLevel3", 1000);
            const auto plane = testplanes::make(7, 7, [dx, dy](int x, int y) {
                return x == 3 + dx && y == 3 + dy ? Pixel{200, 100, 100} : Pixel{100, 100, 100};
            });
            apply<Super_ORV>(params, *plane);
            const double expected = (19.624 * 100 + weights[dx * dx + dy * dy] * 100) / 20;
            EXPECT_EQ(at(*plane, 3, 3)[0], static_cast<int>(expected)) << dx << ',' << dy;
        }
    }
}

TEST(Super_ORV_II, PutsTheHostPixelBackWhereAnyChannelBrightenedTooMuch) {
    // At sliders 0 the threshold is 0.3 / 0.7 * 0.3 + 0.5 = 0.628571.
    const CARGBPlaneProxyDirect proxy(*testplanes::make(4, 1, [](int x, int) {
        const Pixel hosts[] = {{100, 50, 50}, {100, 63, 50}, {62, 50, 50}, {0, 0, 200}};
        return hosts[x];
    }));
    const auto plane = testplanes::make(4, 1, [](int x, int) {
        const Pixel pixels[] = {{200, 50, 50}, {100, 100, 50}, {100, 50, 50}, {0, 0, 200}};
        return pixels[x];
    });
    CUserParams params = level("OrvelaLevel", 0);
    EXPECT_TRUE(apply<Super_ORV_II>(params, *plane));
    EXPECT_EQ(at(*plane, 0, 0), (Pixel{100, 50, 50})) << "0.5";
    EXPECT_EQ(at(*plane, 1, 0), (Pixel{100, 100, 50})) << "0.63 is not below";
    EXPECT_EQ(at(*plane, 2, 0), (Pixel{62, 50, 50})) << "0.62";
    EXPECT_EQ(at(*plane, 3, 0), (Pixel{0, 0, 200})) << "0 / 0 never counts";
    params.mSliderParams.OrvelaLevelEnabled = false;
    EXPECT_FALSE(apply<Super_ORV_II>(params, *plane));
}

} // namespace
