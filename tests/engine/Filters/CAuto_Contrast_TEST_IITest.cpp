#include "Filters/CAuto_Contrast_TEST_II.h"

#include "StretchTestSupport.h"

using namespace orvela;

using namespace stretchtest;

TEST(CAuto_Contrast_TEST_II, GeneratedAndHazyPictures) {
    expectGenerated<CAuto_Contrast_TEST_II>("CAuto_Contrast_TEST_II", with({&P::mAuto_Color_Enabled}));
    expectHazyStretch<CAuto_Contrast_TEST_II>(with({&P::mAuto_Color_Enabled}));
}

TEST(CAuto_Contrast_TEST_II, RunsInTheAutomaticModes) {
    const auto runs = [](U params, bool normal) {
        params.Normal_Picture = normal;
        return applies<CAuto_Contrast_TEST_II>(params, QStringLiteral("Filters/CAuto_Contrast_TEST_II:310"));
    };
    const U all = with(kAutomatic);
    EXPECT_TRUE(runs(all, true) && !runs(all, false) && runs(with({&P::mAuto_Color_Enabled}), false));
    for (bool P::*flag : kAutomatic) {
        U without = all;
        without.mSliderParams.*flag = false;
        EXPECT_FALSE(runs(without, true));
    }
}

// Limits 20 and 100 go half way, to 10 and 177; the factor is 255 / 167. The odd pixel becomes 366, 137,
// 5 * 255 / 177 = 7 and is scaled by 254 / 366.
TEST(CAuto_Contrast_TEST_II, LimitsGoHalfWay) {
    U params = with({&P::mAuto_Color_Enabled});
    const auto plane = halves({20, 20, 20}, {100, 100, 100}, {250, 100, 5}, 1);
    ASSERT_TRUE(apply<CAuto_Contrast_TEST_II>(params, *plane));
    EXPECT_EQ(at(*plane, 0, 0), (Pixel{254, 95, 4}));
    EXPECT_EQ(at(*plane, 1, 0), (Pixel{15, 15, 15}));
    EXPECT_EQ(params.Shift_Level, 1);
    // 255 / 187 * 11 is 15; a double quotient falls just short of it.
    EXPECT_EQ(CAuto_Contrast_TEST_II::stretch(11, {20, 187}, 1), 15);
    EXPECT_EQ(CAuto_Contrast_TEST_II::stretch(20, {20, 187}, 1), 0);
}
