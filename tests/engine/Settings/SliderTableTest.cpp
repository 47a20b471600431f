#include "Settings/SliderTable.h"

#include <gtest/gtest.h>

#include <map>
#include <string>

using namespace orvela;

namespace {

// One of each kind of scale.
TEST(SliderTable, MiddlePositionShowsTheDocumentedNumbers) {
    const std::map<std::string, double> expected = {
        {"sldrTemperature", 6000}, {"sldrGamma_Abs", 1},    {"sldrNoise", 2.75},
        {"sldrContrast_Abs", 0},   {"sldrIllumination", 5}, {"sldrBlackAndWhiteSpots", 50.25},
        {"sldrOrvela1", 50.5},     {"sldrOrvela3", 0.5},    {"sldrShadows_Perc", 127.5},
        {"sldrMiddle_Perc", 1},    {"sldrMoire", 5.05},     {"sldrFade", 50}};
    ASSERT_EQ(SliderTable::advanced().size(), 26U);
    for (const SliderDescription& slider : SliderTable::advanced()) {
        if (const auto found = expected.find(slider.object); found != expected.end()) {
            EXPECT_NEAR(slider.scale->toShown(500), found->second, 1e-9) << slider.object;
        }
    }
}

void expectConsistent(const SliderDescription& slider) {
    SCOPED_TRACE(slider.object);
    EXPECT_NEAR(slider.scale->toShown(0), slider.low, 1e-9);
    EXPECT_NEAR(slider.scale->toShown(1000), slider.high, 1e-9);
    for (int position = 0; position <= 1000; ++position)
        EXPECT_NEAR(slider.scale->toPosition(slider.scale->toShown(position)), position, 1e-6);
}

TEST(SliderTable, EverySliderReachesItsRangeAndComesBackFromEveryPosition) {
    for (const SliderDescription& slider : SliderTable::advanced())
        expectConsistent(slider);
    for (const SliderDescription& slider : SliderTable::finalTouch())
        expectConsistent(slider);
    for (const EGUIMode mode : {Mode_SmartLevels, Mode_Adjustments}) {
        for (const SliderDescription& slider : SliderTable::threeSliders(mode))
            expectConsistent(slider);
    }
    for (int mode = Mode_SmartSharpness; mode <= Mode_ColorFilter; ++mode)
        expectConsistent(*SliderTable::single(static_cast<EGUIMode>(mode)));
    EXPECT_EQ(SliderTable::single(Mode_SmartLevels), nullptr);
    EXPECT_TRUE(SliderTable::threeSliders(Mode_Advanced).empty());
}

// The text is the same at every tenth of a position; a filter takes the gamma as a float.
TEST(SliderScales, GammaIsOneMapForControlsAndFilters) {
    for (int tenth = 0; tenth <= 10000; ++tenth) {
        const double p = tenth / 10.0;
        const double gamma = p < 500 ? p * 0.9 / 500 + 0.1 : (p - 500) * 9 / 500 + 1;
        EXPECT_EQ(static_cast<float>(SliderScales::gammaAt(p)), static_cast<float>(gamma)) << p;
    }
    EXPECT_EQ(SliderScales::Gamma.text(575), "2.3"); // 2.35 lies between two texts
    EXPECT_EQ(SliderScales::Gamma.text(250), "0.6"); // 0.55
    EXPECT_NEAR(SliderScales::Noise.told(250), (1.6 - 0.5) / 0.0045, 1e-9);
}

} // namespace
