#include "Filters/CContrast_Brightness_Perceptual.h"
#include "Filters/CDigital_Flash_Perceptual.h"
#include "Filters/Curves/GammaCurve.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"
#include "support/ParamsText.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

using testplanes::at;
using testplanes::bytes;
using testplanes::Pixel;

Pixel pixel(int r, int g, int b) {
    return {static_cast<std::uint8_t>(r), static_cast<std::uint8_t>(g), static_cast<std::uint8_t>(b)};
}

bool apply(const char* filter, CUserParams params, CARGBPlane& plane, const CARGBPlane& host) {
    const CARGBPlaneProxyDirect proxy(host);
    return tasksettings::apply(filter, params, plane);
}

std::unique_ptr<CARGBPlane> greys() {
    return testplanes::make(256, 1, [](int x, int) { return pixel(x, x, x); });
}

constexpr int kRefused = -1;
constexpr int kKept = -2;

TEST(ToneFilters, FollowTheirSettings) {
    struct Case {
        const char* filter;
        const char* settings;
        int in;
        int out;
    };
    constexpr Case cases[] = {
#include "engine/data/ToneFilterCases.inc"
    };
    const auto host = testplanes::uniform(256, 1, {200, 200, 200});
    for (const Case& c : cases) {
        SCOPED_TRACE(std::string(c.filter) + ' ' + c.settings);
        const auto plane = greys();
        EXPECT_EQ(apply(c.filter, paramsFrom(c.settings), *plane, *host), c.out != kRefused);
        if (c.out >= 0)
            EXPECT_EQ(at(*plane, c.in, 0)[0], c.out);
        else
            EXPECT_EQ(bytes(*plane), bytes(*greys()));
    }
}

TEST(ToneFilters, LogTheirStepsAndNameTheirPlaceWhenStopped) {
    const std::vector<std::array<const char*, 4>> cases = {
        {"Auto_Gamma", "mAuto_Color_Enabled pHisto_Luma[100]=1", "Level_M 1.094171", "107"},
        {"CContrast_Brightness_Perceptual", "Contrast2Enabled Contrast2Value=500 m_P_C_H_C_High=9",
         "Contrast_Value_High4.500000", "160"},
        {"CSpecial_Contrast_Perceptual", "Contrast2Enabled", "CSpecial_Contrast_Perceptual filter complete.",
         "76"}};
    for (const auto& [filter, settings, line, place] : cases) {
        LogCapture log;
        CUserParams params = paramsFrom(settings);
        EXPECT_TRUE(apply(filter, params, *greys(), *greys()));
        EXPECT_TRUE(log.has(line)) << line;
        ExceptionStack::clear();
        params.mCancelRequested = true;
        EXPECT_FALSE(apply(filter, params, *greys(), *greys()));
        EXPECT_TRUE(
            ExceptionStack::entries()[0].startsWith(QByteArray("Filters/") + filter + ':' + place + ' '));
        ExceptionStack::clear();
    }
}

TEST(CDigital_Flash_Perceptual, AValueEqualToTheHostsStaysAtEveryFade) {
    for (int fade = 0; fade <= 1000; fade += 7) {
        const auto plane = greys();
        const CUserParams params = paramsFrom("DigitalFlashEnabled mFade_Value=" + std::to_string(fade));
        EXPECT_TRUE(apply("CDigital_Flash_Perceptual", params, *plane, *greys()));
        ASSERT_EQ(bytes(*plane), bytes(*greys())) << fade;
    }
}

TEST(CGamma_Perceptual, LowersTheFactorForLaterReadersOnlyFromTheMiddleUp) {
    for (const auto& [position, left] : {std::pair{500.F, 0.5F}, {499, 1.5F}}) {
        CUserParams params = paramsFrom("PerceptualGammaEnabled m_M_H_H_F=1.5");
        params.mSliderParams.PerceptualGamma = position;
        const auto plane = greys();
        EXPECT_TRUE(tasksettings::run("CGamma_Perceptual", params, *plane, *plane));
        EXPECT_EQ(params.m_M_H_H_F, left);
    }
}

TEST(Auto_Gamma, SamplesEveryStepthPixelShortOfTheLastStep) {
    for (const auto& [width, height, marked] : {std::array{2000, 30, 398}, {30, 2000, 398}, {5, 300, 0}}) {
        CUserParams params = paramsFrom("mAuto_Color_Enabled");
        const auto plane = testplanes::make(width, height, [](int x, int y) {
            return x % 10 == 0 && y % 10 == 0 ? Pixel{30, 29, 30} : Pixel{90, 90, 90};
        });
        CARGBPlane out(*plane, QStringLiteral("out"));
        EXPECT_TRUE(tasksettings::run("Auto_Gamma", params, *plane, out));
        EXPECT_EQ(params.pHisto_Luma[29], marked);
        EXPECT_EQ(params.pHisto_Luma[90], 0);
    }
    EXPECT_EQ(PixelMath::samplingStep(4000, 3000), 20);
}

// Each line of the file: filter, settings and the samples that ToneFilters.py works out on its own.
TEST(ToneFilters, WeightedCurvesMatchIndependentSamples) {
    constexpr const char* expected[][3] = {
#include "engine/data/ToneFilters.inc"
    };
    const auto host =
        testplanes::make(16, 16, [](int x, int y) { return pixel(17 * (x + y) / 2, 17 * y, 17 * x); });
    for (const auto& [filter, settings, samples] : expected) {
        const auto plane =
            testplanes::make(16, 16, [](int x, int y) { return pixel(17 * x, 17 * (x + y) / 2, 17 * y); });
        EXPECT_TRUE(apply(filter, paramsFrom(settings), *plane, *host));
        const auto result = bytes(*plane);
        const auto hex = QByteArray(reinterpret_cast<const char*>(result.data()), 3 * 256).toHex();
        EXPECT_STREQ(hex.constData(), samples) << filter << ' ' << settings;
    }
}

// At every sum and value that a pixel can have.
template <typename Curve>
void expectCurve(const char* filter, const char* settings, const Curve& curve) {
    const auto plane = testplanes::make(256, 511, [](int x, int y) { return pixel(x, y / 2, y - y / 2); });
    EXPECT_TRUE(apply(filter, paramsFrom(settings), *plane, *plane));
    for (int y = 0; y < 511; ++y) {
        for (int x = 0; x < 256; ++x)
            ASSERT_EQ(at(*plane, x, y)[0], curve.apply(x, curve.weight(x + y))) << x << ' ' << y;
    }
}

TEST(ToneFilters, TablesHoldThePlainCurves) {
    expectCurve("CContrast_Brightness_Perceptual",
                "Contrast2Enabled Contrast2Value=600 Brightness2Enabled m_OriginalLuma=121 m_P_C_H_C_High=70 "
                "m_P_C_H_C_Low=40 m_B_H_C_F_Low=11",
                PerceptualContrast{-11, 42, 24, 121});
    expectCurve(
        "CDigital_Flash_Perceptual",
        "DigitalFlashEnabled mDigital_Flash_Value=500 m_OriginalLuma=100 m_P_C_H_C_F_L=60 m_P_C_H_C_F_H=20",
        FlashContrast{30, 10, 100});
    for (int c = 0; c < 256; ++c)
        ASSERT_EQ(GammaCurve::table(5.5F)[static_cast<std::size_t>(c)], GammaCurve::apply(c, 5.5F));
}

} // namespace
