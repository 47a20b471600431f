#include "Filters/Curves/LevelMath.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

TEST(LevelMath, TablesEqualThePlainOperations) {
    const LevelMath::Levels levels = {40, {30, 0, 90}};
    const auto weight = [](double luma) { return LevelMath::bell(luma, 90, LevelMath::kPerceptualBell); };
    const auto in = testplanes::noise(400, 50);
    for (const LevelMath::MoveTables::Move move : {&LevelMath::darken, &LevelMath::brighten}) {
        const LevelMath::MoveTables tables(levels, weight, move);
        CARGBPlane out(400, 1, QStringLiteral("out"));
        for (int y = 0; y < 50; ++y) {
            tables.apply({y, 400, std::as_const(*in).row(y), out.row(0)});
            for (int x = 0; x < 400; ++x) {
                const testplanes::Pixel p = testplanes::at(*in, x, y);
                const float k = weight((p[0] + p[1] + p[2]) / 3.0);
                for (std::size_t c = 0; c < 3; ++c)
                    ASSERT_EQ(testplanes::at(out, x, 0)[c],
                              int(move(move(p[c], k, levels.common), k, levels.own[c])));
            }
        }
    }
}
