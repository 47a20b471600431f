#include "Filters/SaturationKernel.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

namespace {

using testplanes::bytes;
using testplanes::Pixel;

// Every fourth level and the ends, in all combinations: every hue, range and saturation, greys and black too.
std::unique_ptr<CARGBPlane> colours() {
    const auto level = [](int i) { return static_cast<std::uint8_t>(std::min(4 * i, 255)); };
    return testplanes::make(65, 65 * 65, [&](int x, int y) {
        return Pixel{level(x), level(y % 65), level(y / 65)};
    });
}

TEST(SaturationKernel, TilesAndPlainFormGiveTheSameBytes) {
    using Change = SaturationKernel::Change;
    const std::unique_ptr<CARGBPlane> pictures[] = {colours(), testplanes::noise(777, 200),
                                                    testplanes::noise(256, 9), testplanes::noise(1, 3)};
    for (const auto& in : pictures) {
        for (const auto& [change, alfa] : {std::pair{Change::Lower, 1.0F},
                                           {Change::Lower, 0.3F},
                                           {Change::Raise, 0.402F},
                                           {Change::Raise, 1.2F}}) {
            const SaturationKernel kernel(change, alfa);
            CARGBPlane tiled(*in, QStringLiteral("tiled"));
            CARGBPlane plain(*in, QStringLiteral("plain"));
            for (int y = 0; y < in->height(); ++y) {
                kernel.applyRow(std::as_const(*in).row(y), tiled.row(y), in->width());
                kernel.applyRowPlain(std::as_const(*in).row(y), plain.row(y), in->width());
            }
            EXPECT_TRUE(bytes(tiled) == bytes(plain)) << in->width() << " alfa " << alfa;
        }
    }
}

} // namespace
