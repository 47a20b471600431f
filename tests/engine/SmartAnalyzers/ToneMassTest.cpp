#include "SmartAnalyzers/ToneMass.h"

#include <gtest/gtest.h>

using namespace orvela;

// The outermost bins that can hold a limit, and one step beyond them.
TEST(ToneMass, LimitSearchReachesTheEndsOfTheHistogram) {
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
