#include "Filters/Kernels/SumValueTable.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

// At every sum and value that a pixel can have, with a table of its own for green.
TEST(SumValueTable, HoldsTheCurveOfEverySum) {
    const auto curve = [](int sum, int c) { return static_cast<std::uint8_t>(sum * 7 + c); };
    SumValueTable plain;
    SumValueTable inverse;
    plain.build([&](int sum) { return [&curve, sum](int c) { return curve(sum, c); }; });
    inverse.build([&](int sum) { return [&curve, sum](int c) { return 255 - curve(sum, c); }; });
    const auto in = testplanes::make(256, 511, [](int x, int y) {
        return testplanes::Pixel{static_cast<std::uint8_t>(x), static_cast<std::uint8_t>(y / 2),
                                 static_cast<std::uint8_t>(y - y / 2)};
    });
    CARGBPlane out(*in, QStringLiteral("out"));
    for (int y = 0; y < 511; ++y) {
        SumValueTable::map({&plain, &inverse, &plain}, {y, 256, std::as_const(*in).row(y), out.row(y)});
        for (int x = 0; x < 256; ++x) {
            const testplanes::Pixel p = testplanes::at(*in, x, y);
            const int sum = x + y;
            ASSERT_EQ(testplanes::at(out, x, y),
                      (testplanes::Pixel{curve(sum, p[0]), std::uint8_t(255 - curve(sum, p[1])),
                                         curve(sum, p[2])}));
        }
    }
}
