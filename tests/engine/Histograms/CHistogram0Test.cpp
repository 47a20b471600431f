#include "Histograms/CHistogram0.h"

#include "Histograms/CHistogram_VIII.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

using testplanes::Pixel;

namespace {

// Measures the pixels as the one sampled row of a plane of (count + 1) x 2.
CUserParams measure(const std::vector<Pixel>& pixels) {
    const auto count = static_cast<int>(pixels.size());
    const auto plane = testplanes::make(count + 1, 2, [&](int x, int) {
        return x < count ? pixels[static_cast<std::size_t>(x)] : Pixel{7, 7, 7};
    });
    CUserParams params;
    EXPECT_TRUE(CHistogram0({}, &params, plane.get()).Apply());
    return params;
}

std::vector<Pixel> greys(const std::vector<std::uint8_t>& values) {
    std::vector<Pixel> pixels;
    for (const std::uint8_t v : values)
        pixels.push_back({v, v, v});
    return pixels;
}

// The highlight flag for so many of 100 samples at `level` in each channel, the others one below the
// highlights.
template <typename Task>
float highlightFlag(int red, int green, int blue, std::uint8_t level = 220) {
    const auto plane = testplanes::make(101, 2, [=](int x, int) {
        const auto sample = [=](int count) { return x < count ? level : std::uint8_t{219}; };
        return Pixel{sample(red), sample(green), sample(blue)};
    });
    CUserParams params;
    params.mSliderParams.DigitalFlashEnabled = true;
    params.m_Histo_Light_Exception = -7;
    EXPECT_TRUE(Task({}, &params, plane.get()).Apply());
    return params.m_Histo_Light_Exception;
}

} // namespace

TEST(CHistogram0, CountsBrightAndDarkGreys) {
    EXPECT_EQ(measure(greys({230, 231, 255})).WhiteCount, 2);
    EXPECT_EQ(measure(greys({0, 19, 20})).BlackCount, 2);
    // A range of 44 between the channels is a spread of 29.3, one of 45 a spread of 30.
    EXPECT_EQ(measure({{255, 211, 240}, {255, 210, 240}}).WhiteCount, 1);
    EXPECT_EQ(measure({{0, 44, 10}, {45, 0, 10}}).BlackCount, 1);
}

TEST(CHistogram0, SharesTheLumaAmongBands) {
    const CUserParams params = measure(greys({0, 1, 85, 86, 170, 171, 219, 220, 255}));
    EXPECT_EQ(params.m_Dark_Acu, 2 / 20.0);
    EXPECT_EQ(params.m_Middle_Acu, 2 / 20.0);
    EXPECT_EQ(params.m_Light_Acu, 2 / 20.0);
}

TEST(CHistogram0, MeansAreWholeNumbers) {
    const CUserParams params = measure({{10, 20, 30}, {13, 20, 31}, {12, 22, 30}});
    EXPECT_EQ(params.m_OriginalLuma0, 20);  // (20 + 21 + 21) / 3
    EXPECT_EQ(params.m_OriginalLumaR0, 11); // 35 / 3
    EXPECT_EQ(params.m_OriginalLumaG0, 20); // 62 / 3
    EXPECT_EQ(params.m_OriginalLumaB0, 30); // 91 / 3
}

TEST(CHistogram0, HighlightsLackAColourBelowHalfOfBothOthers) {
    struct Highlights {
        float flag;
        int a, b, c;
        std::uint8_t level = 220;
    };
    for (const auto& [flag, a, b, c, level] : {Highlights{1, 20, 20, 5},
                                               {0, 20, 20, 10},
                                               {0, 20, 9, 10},
                                               {0, 0, 0, 30},
                                               {0, 0, 0, 0},
                                               {1, 20, 20, 5, 255},
                                               {0, 20, 20, 5, 219}}) {
        EXPECT_EQ(highlightFlag<CHistogram0>(a, b, c, level), flag) << a << ' ' << b << ' ' << c;
        EXPECT_EQ(highlightFlag<CHistogram0>(c, a, b, level), flag) << c << ' ' << a << ' ' << b;
        EXPECT_EQ(highlightFlag<CHistogram_VIII>(b, c, a, level), flag) << b << ' ' << c << ' ' << a;
        EXPECT_EQ(highlightFlag<CHistogram_VIII>(a, b, c, level), flag) << a << ' ' << b << ' ' << c;
    }
}
