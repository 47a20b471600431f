#include "Histograms/IHistogram.h"

#include "support/StatisticMap.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>

using namespace orvela;

namespace {

const std::vector<std::string> kSampled = {"CHistogram0",    "CHistogram_III",  "CHistogram_IV",
                                           "CHistogram_VII", "CHistogram_VIII", "CHistogram_Luma_after_Orv"};

CUserParams allSwitchedOn() {
    CUserParams params;
    params.mSliderParams.DigitalFlashEnabled = params.mSliderParams.mAuto_Color_Enabled = true;
    params.mSliderParams.OrvelaLevelEnabled = true;
    return params;
}

bool apply(const std::string& name, CUserParams& params, CARGBPlane& plane) {
    return tasksettings::run(name, params, plane, plane);
}

} // namespace

// Samples lie at multiples of the step in front of the last step rows and columns: only they are bright.
TEST(Histograms, SampleAGridThatDependsOnTheSize) {
    struct Size {
        int width, height, step, columns, rows;
    };
    for (const Size s :
         {Size{699, 699, 1, 698, 698}, Size{700, 100, 5, 139, 19}, Size{2000, 1000, 10, 199, 99},
          Size{1500, 1500, 5, 299, 299}, Size{1200, 800, 6, 199, 132}, Size{1000, 700, 5, 199, 139},
          Size{700, 1403, 7, 99, 199}, Size{2, 2, 1, 1, 1}, Size{800, 4, 5, 159, 0}}) {
        const auto plane = testplanes::make(s.width, s.height, [&s](int x, int y) {
            const bool sampled =
                x % s.step == 0 && y % s.step == 0 && x < s.columns * s.step && y < s.rows * s.step;
            return sampled ? testplanes::Pixel{200, 100, 0} : testplanes::Pixel{9, 9, 9};
        });
        const double count = s.step * s.step * s.columns * s.rows;
        for (const std::string& name : kSampled) {
            CUserParams params = allSwitchedOn();
            EXPECT_TRUE(apply(name, params, *plane));
            EXPECT_EQ(params.pHisto_Luma[100], count) << name << s.width;
            EXPECT_EQ(params.pHisto_Red[200] + params.pHisto_Green[100] + params.pHisto_Blue[0], 3 * count);
            EXPECT_EQ(sumOf(params.pHisto_Luma, 0, 255) + sumOf(params.pHisto_Blue, 1, 255), count);
            const bool first = name == "CHistogram0";
            EXPECT_EQ(params.m_OriginalLumaR0, first && s.rows > 0 ? 200 : 0);
            EXPECT_EQ(params.m_OriginalLumaR, first ? 0 : std::trunc(200 * count / plane->pixelCount()))
                << name;
        }
    }
}

TEST(Histograms, StopOrClosedConditionLeavesTheFields) {
    const auto plane = testplanes::noise(20, 20);
    const auto expectUntouched = [&plane](const std::string& name, CUserParams params, bool zeroesBands) {
        markStatistics(params);
        params.Normal_Picture = false;
        params.pHisto_Luma.fill(3);
        auto fields = statistics(params);
        for (const char* band : {"Dark_Ave", "Middle_Ave", "Light_Ave"})
            fields[band] = zeroesBands ? 0 : -7;
        EXPECT_FALSE(apply(name, params, *plane)) << name;
        EXPECT_EQ(statistics(params), fields) << name;
        EXPECT_EQ(params.pHisto_Luma[0], 3);
    };
    CUserParams stopped = allSwitchedOn();
    stopped.mCancelRequested = true;
    for (const std::string& name : kSampled)
        expectUntouched(name, stopped, name == "CHistogram_III" || name == "CHistogram_IV");
    for (const char* name : {"CHistogram_IV", "CHistogram_VIII"})
        expectUntouched(name, CUserParams(), false);
    expectUntouched("CHistogram_Luma_after_Orv", allSwitchedOn(), false);
}

TEST(Histograms, LumaAfterIterationsNeedsANormalIteratedPicture) {
    const auto plane = testplanes::noise(9, 9);
    for (int bits = 0; bits < 16; ++bits) {
        CUserParams params;
        params.mSliderParams.OrvelaLevelEnabled = bits & 1;
        params.mSliderParams.OrvelaLevel2Enabled = bits & 2;
        params.Normal_Picture = bits & 4;
        params.Under_Exposed_Picture = bits & 8;
        EXPECT_EQ(apply("CHistogram_Luma_after_Orv", params, *plane), bits >= 5 && bits <= 7) << bits;
    }
}
