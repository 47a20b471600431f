#include "Filters/CLevel_Middle_Perceptual.h"
#include "Filters/LevelMath.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/LogCapture.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <sstream>

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

bool set(CUserParams& params, const std::string& name, float value) {
    if (name == "Final_Touch_Mode_Enabled") {
        params.Final_Touch_Mode_Enabled = value != 0;
        return true;
    }
#define ORVELA_STATISTIC_FIELD(type, field, initial, listed)                                                 \
    if (name == #field) {                                                                                    \
        params.field = static_cast<type>(value);                                                             \
        return true;                                                                                         \
    }
#define ORVELA_KEPT_FIELD(type, field, listed) ORVELA_STATISTIC_FIELD(type, field, 0, listed)
#include "Utility/StatisticFields.inc"
    for (const SliderField& field : sliderFields()) {
        if (name != field.name)
            continue;
        if (field.value)
            params.mSliderParams.*field.value = value;
        else
            params.mSliderParams.*field.flag = value != 0;
        return true;
    }
    return false;
}

CUserParams settingsOf(const std::string& text) {
    CUserParams params;
    std::istringstream words(text);
    for (std::string name, value; std::getline(words >> std::ws, name, '=') && words >> value;)
        EXPECT_TRUE(set(params, name, std::stof(value))) << name;
    return params;
}

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
        CUserParams params = settingsOf(each.settings);
        const bool applies = *each.expected != '\0';
        EXPECT_EQ(tasksettings::run(each.filter, params, *in, out), applies);
        const std::string after = applies ? each.expected : before;
        const bool leavesLastRow = std::string(each.filter) == "CLevel_Dark_Left_Perceptual";
        EXPECT_EQ(row(out, 0), after);
        EXPECT_EQ(row(out, 1), leavesLastRow ? before : after);
    }
}

// Every pixel of a noise picture in place of the few above.
std::vector<std::uint8_t> noiseAfter(const std::string& filter, const std::string& settings) {
    const auto in = testplanes::noise(40, 30);
    CARGBPlane out(*in, QStringLiteral("out"));
    CUserParams params = settingsOf(settings);
    EXPECT_TRUE(tasksettings::run(filter, params, *in, out)) << filter;
    return bytes(*in);
}

TEST(LevelFilters, NeutralSettingsAreTheIdentity) {
    const std::vector<std::pair<const char*, const char*>> neutral = {
        {"CLevel_Dark_Left", "m_OriginalLuma=120 mAbsolute_Dark_Enabled=1"},
        {"CLevel_Middle", "m_OriginalLuma=120.7 mAbsolute_Middle_Enabled=1 mAbsolute_Middle_Value=500"},
        {"CLevel_Dark_Left_Perceptual", "m_OriginalLuma=120 PerceptualDarkEnabled=1 m_L_H_L_F=80"},
        {"CLevel_Middle_Perceptual",
         "m_OriginalLuma=120 PerceptualMiddleEnabled=1 PerceptualMiddle=500 m_M_H_H_F=0.7"},
        {"CLevel_Light_Right_Perceptual", "m_OriginalLuma=120 PerceptualLightEnabled=1 m_R_L_L_F=300"}};
    const auto before = bytes(*testplanes::noise(40, 30));
    for (const auto& [filter, settings] : neutral)
        EXPECT_EQ(noiseAfter(filter, settings), before) << filter;
}

TEST(LevelFilters, TablesEqualThePlainOperations) {
    const LevelMath::Levels levels = {40, {30, 0, 90}};
    const auto weight = [](double luma) { return LevelMath::bell(luma, 90, LevelMath::kPerceptualBell); };
    const auto in = testplanes::noise(400, 50);
    for (const LevelMath::MoveTables::Move move : {&LevelMath::darken, &LevelMath::brighten}) {
        const LevelMath::MoveTables tables(levels, weight, move);
        const auto out = testplanes::make(400, 1, [](int, int) { return Pixel{}; });
        for (int y = 0; y < 50; ++y) {
            tables.applyRow(std::as_const(*in).row(y), out->row(0), 400);
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
    mapKeepingHue(maps, std::as_const(*in).row(0), in->row(0), 1);
    EXPECT_EQ(at(*in, 0, 0), (Pixel{254, 254, 198})); // 235 * 254 / 300 = 198.97
}

TEST(LevelFilters, PerceptualMidtonesDecreaseTheHighCoefficientForGood) {
    CUserParams params =
        settingsOf("PerceptualMiddleEnabled=1 PerceptualMiddle=500 m_M_H_H_F=2.5 m_M_H_H_F_B=3");
    const auto prepare = [&params] {
        const auto in = input();
        CARGBPlane out(*in, QStringLiteral("out"));
        EXPECT_TRUE(CLevel_Middle_Perceptual(&params, in.get(), &out).Apply());
    };
    for (const float expected : {1.5F, 0.5F, 0.5F}) {
        prepare();
        EXPECT_EQ(params.m_M_H_H_F, expected);
    }
    params.Final_Touch_Mode_Enabled = params.mSliderParams.mPerceptual_Touch_Middle_B_Enabled = true;
    params.mSliderParams.mPerceptual_Touch_Middle_Value_B = 500;
    prepare();
    EXPECT_EQ(params.m_M_H_H_F_B, 2);
    params.mSliderParams.mPerceptual_Touch_Middle_Value_B = 499;
    prepare();
    EXPECT_EQ(params.m_M_H_H_F_B, 2);
}

std::vector<std::string> logOf(const std::string& filter, const std::string& settings) {
    const LogCapture log;
    noiseAfter(filter, settings);
    return log.lines();
}

TEST(LevelFilters, LogTheirBranchAndFactors) {
    const auto expectLines = [](const char* filter, const char* settings, std::vector<std::string> expected) {
        std::string all = "\n";
        for (const std::string& line : logOf(filter, settings))
            all += line.substr(std::min(line.find_first_not_of('\t'), line.size())) + "\n";
        for (const std::string& line : expected)
            EXPECT_NE(all.find("\n" + line + "\n"), std::string::npos) << line << " not in" << all;
    };
    expectLines("CLevel_Dark_Left", "mAbsolute_Dark_Enabled=1",
                {"!Final_Touch_Mode_Enabled  1.", "CLevel_Dark_Left Condition matched.",
                 "CLevel_Dark_Left Filter complete."});
    expectLines("CLevel_Middle", "mAbsolute_Middle_Enabled=1 mAbsolute_Middle_Value=250",
                {"Middle_Level_Value  250.000000", "CLevel_Middle Condition matched."});
    expectLines("CLevel_Dark_Left_Perceptual", "PerceptualDarkEnabled=1",
                {"!Final_Touch_Mode_Enabled 000 1.", "CLevel_Dark_Left_Perceptual 1st Condition matched.",
                 "Perceptual_Touch_Tone_Dark_Enabled  0", " Normal_Picture1", " !Touch_Tone_Dark_Enabled 1",
                 "CLevel_Dark_Left_Perceptual Filter complete."});
    expectLines("CLevel_Middle_Perceptual",
                "Final_Touch_Mode_Enabled=1 mPerceptual_Touch_Middle_G_Enabled=1 m_OriginalLumaG=51 "
                "mPerceptual_Touch_Middle_Value_G=1000 m_M_H_H_F_G=1.5 m_M_H_L_F_G=0.25",
                {"CLevel_Middle_Perceptual FINAL TOUCH 1st Condition matched.",
                 "Perceptual_Touch_Middle_Value_G 1000. m_M_H_H_F_G 1.500000 ; m_M_H_L_F_G 0.250000",
                 "CLevel_Middle_Perceptual TOUCH 2nd Condition matched.", "Shadow_Radio_RGB 1.000000.",
                 "Shadow_Radio_G 2.094828."}); // 255 * 0.2^(1 / 1.85) / 51
    const std::string red =
        "Final_Touch_Mode_Enabled=1 mPerceptual_Touch_Middle_R_Enabled=1 m_M_H_L_F_R=0.1 ";
    const auto expectRed = [&](const std::string& settings, const std::string& ratio) {
        expectLines("CLevel_Middle_Perceptual", (red + settings).c_str(), {"Shadow_Radio_R " + ratio});
    };
    // At most the imbalance 2, times 1.5 above 100: then 255 * (101 / 255)^(1 / 7) / 101.
    const std::string high = "mPerceptual_Touch_Middle_Value_R=1000 m_M_H_H_F_R=5 ";
    expectRed(high + "m_OriginalLumaR=100 m_OriginalLumaG=200 m_OriginalLumaB=200", "2.000000.");
    expectRed(high + "m_OriginalLumaR=101 m_OriginalLumaG=202 m_OriginalLumaB=202", "2.211867.");
    // At least 1.3 over the imbalance, times 1.1 above 80.
    expectRed("m_OriginalLumaR=80 m_OriginalLumaG=160 m_OriginalLumaB=160", "0.650000.");
    expectRed("m_OriginalLumaR=81 m_OriginalLumaG=162 m_OriginalLumaB=162", "0.715000.");
}

} // namespace
