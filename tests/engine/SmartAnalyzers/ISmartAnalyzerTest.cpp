#include "Filters/Kernels/HistogramRecount.h"
#include "SmartAnalyzers/ToneMass.h"
#include "support/ParamsText.h"
#include "support/StatisticMap.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>
#include <fstream>
#include <string>

using namespace orvela;

namespace {

// Parameters with patterned histograms whose statistics hold a value that no analyzer writes.
CUserParams patternedParams() {
    CUserParams params;
    markStatistics(params);
    for (std::size_t i = 0; i < 256; ++i) {
        params.pHisto_Luma[i] = static_cast<double>(i * 37 % 101);
        params.pHisto_Red[i] = static_cast<double>((i * 37 + 11) % 101);
        params.pHisto_Green[i] = static_cast<double>((i * 37 + 22) % 101);
        params.pHisto_Blue[i] = static_cast<double>((i * 37 + 33) % 101);
    }
    return params;
}

// Reads the formula of a plane, which the script explains, and makes it.
std::unique_ptr<CARGBPlane> readPlane(std::istream& file) {
    int power, step, modulus, red, green, blue;
    file >> power >> step >> modulus >> red >> green >> blue;
    return testplanes::make(40, 450, [=](int x, int y) {
        const int k = x + 3 * y;
        const int value = step * ((power == 2 ? k * k : k) % modulus);
        const auto sample = [value](int first) { return static_cast<std::uint8_t>(first + value); };
        return testplanes::Pixel{sample(red), sample(green), sample(blue)};
    });
}

// Reads a case of the data file and compares every statistic after the analyzer's run.
void runCase(std::istream& file) {
    std::string analyzer, verb, name;
    file >> analyzer;
    const auto plane = readPlane(file);
    CUserParams params = patternedParams();
    std::map<std::string, double> expected;
    for (double value = 0; file >> verb && verb != "end";) {
        if (verb == "clear") {
            params.pHisto_Luma.fill(0);
            continue;
        }
        file >> name >> value;
        if (verb == "bin")
            params.pHisto_Luma[std::stoul(name)] = value;
        else if (verb == "set")
            setField(params, QString::fromStdString(name), value);
        else
            expected[name] = value;
    }
    CUserParams counted = params;
    if (!expected.empty() && (analyzer.ends_with("Dark") || analyzer.ends_with("Right")))
        recountHistograms(*plane, counted, 5, 1);
    expected.merge(statistics(params));
    EXPECT_TRUE(tasksettings::run(analyzer, params, *plane, *plane));
    for (const auto& [field, value] : statistics(params))
        EXPECT_NEAR(value, expected[field], 1e-12 * std::abs(value)) << analyzer << ' ' << field;
    EXPECT_EQ(params.pHisto_Luma, counted.pHisto_Luma);
}

} // namespace

TEST(SmartAnalyzers, GiveTheIndependentResults) {
    std::ifstream file(ORVELA_TEST_DATA "/analyzers.txt");
    int cases = 0;
    for (std::string verb; file >> verb; ++cases) {
        SCOPED_TRACE("case " + std::to_string(cases));
        runCase(file);
    }
    EXPECT_EQ(cases, 80);
}

// The outermost bins that can hold a limit, and one step beyond them.
TEST(SmartAnalyzers, LimitSearchReachesTheEndsOfTheHistogram) {
    const auto counted = [](std::initializer_list<std::size_t> filled) {
        CUserParams params;
        for (const std::size_t i : filled)
            params.pHisto_Red[i] = params.pHisto_Green[i] = params.pHisto_Blue[i] = 1;
        return params;
    };
    EXPECT_EQ(ToneMass::leftLimit(counted({253, 254, 255})), 253);
    EXPECT_EQ(ToneMass::leftLimit(counted({254, 255})), 0);
    EXPECT_EQ(ToneMass::rightLimit(counted({1, 2})), 2);
    EXPECT_EQ(ToneMass::rightLimit(counted({0, 1})), 255);
}

// The last bin stays in the histogram: 0.077 / ((tanh(1) + 1) / 2) * 50 is 4.37.
TEST(SmartAnalyzers, DigitalFlashCountsAWhitePicture) {
    CUserParams params = tasksettings::paramsFor("CSmartAnalyzer_Digital_Flash");
    params.m_OriginalLuma = 255;
    params.pHisto_Luma[255] = 4;
    const auto plane = testplanes::uniform(2, 2, {255, 255, 255});
    EXPECT_TRUE(tasksettings::run("CSmartAnalyzer_Digital_Flash", params, *plane, *plane));
    EXPECT_EQ(params.m_P_C_H_C_F_H, 4);
}
