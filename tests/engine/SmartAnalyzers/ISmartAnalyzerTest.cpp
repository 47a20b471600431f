#include "SmartAnalyzers/ISmartAnalyzer.h"

#include "Utility/CGenericEx.h"
#include "support/TestPlanes.h"

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
}

} // namespace
