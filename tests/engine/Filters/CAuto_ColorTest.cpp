#include "Filters/CAuto_Color.h"

#include "StretchTestSupport.h"

using namespace orvela;

using namespace stretchtest;

TEST(CAuto_Color, GeneratedPictures) {
    expectGenerated<CAuto_Color>("CAuto_Color", with({&P::mAuto_Color_Enabled}));
    EXPECT_FLOAT_EQ(CAuto_Color::leftLimit(250, 0.5F), 120);
    EXPECT_FLOAT_EQ(CAuto_Color::leftLimit(101, 0.6F), 74.326116F);
    EXPECT_FLOAT_EQ(CAuto_Color::rightLimit(200, 0.75F), 225.02631F);
}

// A bin must exceed 3 * sqrt(100), on the right together with its two neighbours.
TEST(CAuto_Color, ScansSkipThinBinsAndSinglePeaks) {
    U params = with({&P::mAuto_Color_Enabled});
    params.mSliderParams.mAuto_Color_Value = 1000;
    params.pHisto_Red[5] = 29;
    for (const std::size_t bin : {9U, 198U, 199U, 200U, 250U, 251U})
        params.pHisto_Red[bin] = 31;
    params.pHisto_Green[255] = 50;
    params.pHisto_Blue[0] = params.pHisto_Blue[1] = params.pHisto_Blue[2] = 31;
    const auto plane = uniform(10, 10, {100, 100, 100});
    ASSERT_TRUE(apply<CAuto_Color>(params, *plane));
    EXPECT_EQ(at(*plane, 9, 9), (Pixel{CAuto_Color::curve(100, 9, 200), 100, CAuto_Color::curve(100, 0, 2)}));
}
