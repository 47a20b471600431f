#include "SmartAnalyzers/ISmartAnalyzer.h"

#include "Filters/Kernels/HistogramRecount.h"
#include "Utility/CGenericEx.h"
#include "support/ParamsText.h"
#include "support/TaskSettings.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class FailingAnalyzer final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override { throw 1; }
};

TEST(ISmartAnalyzer, FailuresReachTheCaller) {
    CUserParams params;
    const auto plane = testplanes::uniform(1, 1, {});
    const auto messageOf = [](CUserParams* p, CARGBPlane* picture) {
        try {
            FailingAnalyzer({}, p, picture).Apply();
        } catch (const CGenericEx& failure) {
            return failure.message().toStdString() + "@" + std::to_string(failure.line());
        }
        return std::string();
    };
    EXPECT_EQ(messageOf(&params, plane.get()), "An error occured while running a SmartAnalyzer object.@40");
    EXPECT_EQ(messageOf(nullptr, plane.get()), "The User Settings object was invalid.@26");
    EXPECT_EQ(messageOf(&params, nullptr), "The analyzer has an invalid Input plane.@31");
    ExceptionStack::clear();
}

// Those of the shadows and highlights leave the histograms that they counted, once they have work.
TEST(ISmartAnalyzer, ShadowsAndHighlightsLeaveTheirCounts) {
    const auto plane = testplanes::noise(40, 450);
    for (const char* level : {"Dark", "Right"}) {
        CUserParams counted;
        recountHistograms(*plane, counted, 5, 1);
        CUserParams params = paramsFrom("PerceptualDarkEnabled");
        const std::string task = std::string("CSmartAnalyzer_Perceptual_Level_") + level;
        EXPECT_TRUE(tasksettings::apply(task, params, *plane));
        EXPECT_EQ(params.pHisto_Luma, counted.pHisto_Luma) << level;
        EXPECT_EQ(params.pHisto_Blue, counted.pHisto_Blue) << level;
    }
}

} // namespace
