#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/ParamsText.h"
#include "support/TaskSettings.h"

#include <gtest/gtest.h>

using namespace orvela;

// Both filters that fade toward the host's pixel: CAuto_Contrast_I and CDigital_Flash_Perceptual.
TEST(CAuto_Contrast_I, AValueEqualToTheHostsStaysAtEveryFade) {
    const auto greys = testplanes::make(256, 1, [](int x, int) {
        const auto v = static_cast<std::uint8_t>(x);
        return testplanes::Pixel{v, v, v};
    });
    const CARGBPlaneProxyDirect proxy(*greys);
    for (int fade = 0; fade <= 1000; fade += 7) {
        for (const auto& [task, settings] :
             {std::pair{"CDigital_Flash_Perceptual", "DigitalFlashEnabled mFade_Value="},
              {"CAuto_Contrast_I", "OrvelaLevelEnabled m_OriginalLumaR0=9 m_OriginalLumaG0=9 "
                                   "m_OriginalLumaB0=9 m_OriginalLumaR=9 "
                                   "m_OriginalLumaG=9 m_OriginalLumaB=9 mFade_Value="}}) {
            CUserParams params = paramsFrom(settings + std::to_string(fade));
            CARGBPlane plane(*greys, QStringLiteral("plane"));
            EXPECT_TRUE(tasksettings::apply(task, params, plane));
            ASSERT_EQ(testplanes::bytes(plane), testplanes::bytes(*greys)) << task << fade;
        }
    }
}
