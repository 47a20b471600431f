#include "Filters/Curves/LevelMath.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/LogCapture.h"
#include "support/ParamsText.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <sstream>

using namespace orvela;

namespace {

using testplanes::at;
using testplanes::bytes;
using testplanes::Pixel;

struct Case {
    const char* filter;
    const char* settings;
    const char* expected;
};

#define LEVEL_PIXELS(...) const std::vector<Pixel> kPixels = {__VA_ARGS__};
#define LEVEL_CASE(filter, settings, expected)
#include "engine/data/LevelCases.inc"
#undef LEVEL_PIXELS
#undef LEVEL_CASE

#define LEVEL_PIXELS(...)
#define LEVEL_CASE(filter, settings, expected) {#filter, settings, expected},
const std::vector<Case> kCases = {
#include "engine/data/LevelCases.inc"
};

std::string row(const CARGBPlane& plane, int y) {
    std::ostringstream text;
    for (int x = 0; x < plane.width(); ++x) {
        const Pixel p = at(plane, x, y);
        text << (x > 0 ? " " : "") << int{p[0]} << ',' << int{p[1]} << ',' << int{p[2]};
    }
    return text.str();
}

// Two equal rows, so that a filter that leaves the last one alone shows it.
std::unique_ptr<CARGBPlane> input() {
    return testplanes::make(static_cast<int>(kPixels.size()), 2,
                            [](int x, int) { return kPixels[static_cast<std::size_t>(x)]; });
}

TEST(LevelFilters, MapPixelsAsWorkedOutIndependently) {
    const auto host = testplanes::make(static_cast<int>(kPixels.size()), 2, [](int x, int) {
        Pixel p = kPixels[static_cast<std::size_t>(x)];
        for (std::uint8_t& sample : p)
            sample = static_cast<std::uint8_t>(255 - sample);
        return p;
    });
    const CARGBPlaneProxyDirect proxy(*host);
    for (const Case& each : kCases) {
        SCOPED_TRACE(std::string(each.filter) + ": " + each.settings);
        const auto in = input();
        const std::string before = row(*in, 0);
        CARGBPlane out(*in, QStringLiteral("out"));
        CUserParams params = paramsFrom(each.settings);
        const bool applies = *each.expected != '\0';
        EXPECT_EQ(tasksettings::run(each.filter, params, *in, out), applies);
        const std::string after = applies ? each.expected : before;
        const bool leavesLastRow = std::string(each.filter) == "CLevel_Dark_Left_Perceptual";
        EXPECT_EQ(row(*in, 0), after);
        EXPECT_EQ(row(*in, 1), leavesLastRow ? before : after);
    }
}

TEST(LevelFilters, TablesEqualThePlainOperations) {
    const LevelMath::Levels levels = {40, {30, 0, 90}};
    const auto weight = [](double luma) { return LevelMath::bell(luma, 90, LevelMath::kPerceptualBell); };
    const auto in = testplanes::noise(400, 50);
    for (const LevelMath::MoveTables::Move move : {&LevelMath::darken, &LevelMath::brighten}) {
        const LevelMath::MoveTables tables(levels, weight, move);
        const auto out = testplanes::make(400, 1, [](int, int) { return Pixel{}; });
        for (int y = 0; y < 50; ++y) {
            tables.apply({y, 400, std::as_const(*in).row(y), out->row(0)});
            for (int x = 0; x < 400; ++x) {
                const Pixel p = at(*in, x, y);
                const float k = weight((p[0] + p[1] + p[2]) / 3.0);
                for (std::size_t c = 0; c < 3; ++c)
                    ASSERT_EQ(at(*out, x, 0)[c], int(move(move(p[c], k, levels.common), k, levels.own[c])));
            }
        }
    }
}

TEST(LevelFilters, OverflowingMidtonesKeepTheHue) {
    const WideTables maps = LevelMath::factorMaps(300 / 255.0F, {1, 1, 1});
    const auto in = testplanes::uniform(1, 1, {255, 255, 200}); // 300, 300, 235
    mapKeepingHue(maps, {0, 1, std::as_const(*in).row(0), in->row(0)});
    EXPECT_EQ(at(*in, 0, 0), (Pixel{254, 254, 198})); // 235 * 254 / 300 = 198.97
}

TEST(LevelFilters, PerceptualMidtonesDecreaseTheHighCoefficientForGood) {
    CUserParams params =
        paramsFrom("PerceptualMiddleEnabled=1 PerceptualMiddle=500 m_M_H_H_F=2.5 m_M_H_H_F_B=3");
    const auto prepare = [&params] {
        EXPECT_TRUE(tasksettings::run("CLevel_Middle_Perceptual", params, *input(), *input()));
    };
    for (const float expected : {1.5F, 0.5F, 0.5F}) {
        prepare();
        EXPECT_EQ(params.m_M_H_H_F, expected);
    }
    params.Final_Touch_Mode_Enabled = params.mSliderParams.mPerceptual_Touch_Middle_B_Enabled = true;
    for (const float position : {500.0F, 499.0F}) {
        params.mSliderParams.mPerceptual_Touch_Middle_Value_B = position;
        prepare();
        EXPECT_EQ(params.m_M_H_H_F_B, 2);
    }
}

// The branches of the touched midtones show in their logged ratios.
TEST(LevelFilters, TouchedMidtonesAreBounded) {
    const std::string green = "mPerceptual_Touch_Middle_G_Enabled mPerceptual_Touch_Middle_Value_G=1000 "
                              "m_M_H_H_F_G=1.5 m_M_H_L_F_G=0.25 ";
    const std::string red = "mPerceptual_Touch_Middle_R_Enabled m_M_H_L_F_R=0.1 ";
    const std::string high = red + "mPerceptual_Touch_Middle_Value_R=1000 m_M_H_H_F_R=5 ";
    const std::vector<std::array<std::string, 2>> cases = {
        {green + "m_OriginalLumaG=51", "G 2.094828."}, // 255 * 0.2^(1 / 1.85) / 51
        // At most the imbalance 2, times 1.5 above 100: then 255 * (101 / 255)^(1 / 7) / 101.
        {high + "m_OriginalLumaR=100 m_OriginalLumaG=200 m_OriginalLumaB=200", "R 2.000000."},
        {high + "m_OriginalLumaR=101 m_OriginalLumaG=202 m_OriginalLumaB=202", "R 2.211867."},
        // At least 1.3 over the imbalance, times 1.1 above 80.
        {red + "m_OriginalLumaR=80 m_OriginalLumaG=160 m_OriginalLumaB=160", "R 0.650000."},
        {red + "m_OriginalLumaR=81 m_OriginalLumaG=162 m_OriginalLumaB=162", "R 0.715000."}};
    for (const auto& [settings, ratio] : cases) {
        const LogCapture log;
        CUserParams params = paramsFrom("Final_Touch_Mode_Enabled " + settings);
        EXPECT_TRUE(tasksettings::run("CLevel_Middle_Perceptual", params, *input(), *input()));
        EXPECT_TRUE(log.has("Shadow_Radio_" + ratio)) << settings;
    }
}

} // namespace
