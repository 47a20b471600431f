#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <fstream>

using namespace orvela;

namespace {

// A picture from hexadecimal RGB bytes.
std::unique_ptr<CARGBPlane> decode(int width, int height, const std::string& hex) {
    const QByteArray samples = QByteArray::fromHex(QByteArray::fromStdString(hex));
    return testplanes::make(width, height, [p = samples.begin()](int, int) mutable {
        const auto sample = [&p] { return static_cast<std::uint8_t>(*p++); };
        return testplanes::Pixel{sample(), sample(), sample()};
    });
}

// Results of another implementation, in Python, of the same formulas: see data/colour_detail.py.
TEST(ColourDetailReference, EveryFilterGivesTheReferencePictures) {
    std::ifstream file(ORVELA_TEST_DATA "/colour_detail.txt");
    std::string task, input, host, expected;
    float position = 0;
    int width = 0;
    int height = 0;
    int cases = 0;
    for (; file >> task >> position >> width >> height >> input >> host >> expected; ++cases) {
        const auto in = decode(width, height, input);
        CARGBPlane out(*in, QStringLiteral("out"));
        const CARGBPlaneProxyDirect proxy(*decode(width, height, host));
        CUserParamsPhotoshop params = tasksettings::paramsFor(task, position);
        params.m_OriginalLumaR = 90.5F;
        params.m_OriginalLumaG = 128;
        params.m_OriginalLumaB = 40;
        ASSERT_TRUE(tasksettings::run(task, params, *in, out));
        EXPECT_EQ(testplanes::bytes(*in), testplanes::bytes(*decode(width, height, expected)))
            << task << " at " << position << ", width " << width;
    }
    EXPECT_EQ(cases, 34);
}

} // namespace
