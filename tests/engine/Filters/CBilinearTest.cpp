#include "Utility/CGenericEx.h"
#include "support/FailingArrays.h"
#include "support/LogCapture.h"
#include "support/ParamsText.h"
#include "support/TaskSettings.h"

#include <gtest/gtest.h>

using namespace orvela;

TEST(CBilinear, MissingMemoryForEitherTableEndsTheFilter) {
    const auto plane = testplanes::noise(5, 5);
    const auto before = testplanes::bytes(*plane);
    for (const auto& [floats, name] : {std::pair{4, "m_cBilinear"}, {195076, "m_sBilinear"}}) {
        CUserParams params = paramsFrom("BilinearFilteringEnabled");
        const LogCapture log;
        const FailingArrays none(static_cast<std::size_t>(floats) * sizeof(float));
        EXPECT_FALSE(tasksettings::apply("CBilinear", params, *plane));
        EXPECT_TRUE(log.has("Bilinear filter was unable to declare the " + std::to_string(floats) +
                            " floats array (" + name + ")."));
        EXPECT_EQ(testplanes::bytes(*plane), before);
    }
    EXPECT_EQ(ExceptionStack::oldestMessage(),
              "Bilinear filter was unable to declare the m_cBilinear floats array.");
}
