#include "Filters/CBilinear.h"

#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"
#include "support/TaskSettings.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

// Has memory for tables up to a size only.
struct StarvedBilinear final : CBilinear {
    using CBilinear::CBilinear;
    Floats allocate(std::size_t count) const override {
        return count > largest ? nullptr : CBilinear::allocate(count);
    }
    std::size_t largest = 0;
};

TEST(CBilinear, MissingMemoryIsReportedAndEndsTheFilter) {
    CUserParams params = tasksettings::paramsFor("CBilinear");
    const auto plane = testplanes::noise(5, 5);
    const auto before = testplanes::bytes(*plane);
    for (const auto& [largest, table] :
         {std::pair{3U, "4 floats array (m_cBilinear)"}, {195075U, "195076 floats array (m_sBilinear)"}}) {
        const LogCapture log;
        CARGBPlane out(*plane, QStringLiteral("out"));
        StarvedBilinear filter({}, &params, plane.get(), &out);
        filter.largest = largest;
        EXPECT_FALSE(filter.Apply());
        EXPECT_TRUE(filter.failure().outOfMemory);
        EXPECT_TRUE(log.has(std::string("Bilinear filter was unable to declare the ") + table + "."));
        EXPECT_EQ(testplanes::bytes(*plane), before);
    }
    EXPECT_EQ(ExceptionStack::oldestMessage(),
              "Bilinear filter was unable to declare the m_cBilinear floats array.");
    ExceptionStack::clear();
}

} // namespace
