#include "hosts/TestPhotograph.h"
#include "support/HostedPicture.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>

using namespace orvela;

namespace {

Photograph counting(ColorModel model, int width, int height) {
    return testPhotograph(model, 8, width, height, [](std::size_t i) { return i; });
}

TEST(ImageHost, MapsEndsToEndsAndLosesAtMostOne) {
    EXPECT_EQ(toHostSample(0), 0);
    EXPECT_EQ(toHostSample(65535), 32768);
    EXPECT_EQ(toHostSample(1), 1); // (32768 + 32767) / 65535
    EXPECT_EQ(toFileSample(32768), 65535);
    EXPECT_EQ(toFileSample(1), 2);
    EXPECT_EQ(toFileSample(40000), 65535);
    for (int v = 0; v <= 65535; ++v)
        ASSERT_LE(std::abs(v - toFileSample(toHostSample(static_cast<std::uint16_t>(v)))), 1) << v;
}

// A 4 x 3 RGB picture counts its samples: pixel (x, y) plane p holds 3 * (4 * y + x) + p.
TEST(ImageHost, AnswersRequestsOverPartsOfTheImage) {
    HostedPicture host(counting(ColorModel::Rgb, 4, 3));
    host::FilterRecord& record = host.record();
    record.inRect = {1, 2, 3, 4};
    record.inLoPlane = 1;
    record.inHiPlane = 2;
    record.outRect = {0, 0, 1, 2};
    record.outLoPlane = record.outHiPlane = 2;
    ASSERT_EQ(record.advanceState(), 0);
    const auto* in = static_cast<const std::uint8_t*>(record.inData);
    ASSERT_GT(record.inRowBytes, 4);
    EXPECT_EQ((std::vector<int>{in[0], in[1], in[2], in[3]}), (std::vector<int>{19, 20, 22, 23}));
    EXPECT_EQ(in[record.inRowBytes], 31);
    auto* out = static_cast<std::uint8_t*>(record.outData);
    EXPECT_EQ(out[1], 5); // the current destination
    out[1] = 99;
    EXPECT_EQ(host.result.samples[5], 5); // not before the next call
    record.outRect = {};
    ASSERT_EQ(record.advanceState(), 0);
    EXPECT_EQ(host.result.samples[5], 99);
    EXPECT_EQ(host.result.samples[8], 8);
    EXPECT_TRUE(record.outData == nullptr); // packed: no reference may bind
    EXPECT_EQ(record.outRowBytes, 0);
    record.outRect = {0, 0, 1, 2};
    record.inRect = {0, 0, 1, 2};
    ASSERT_EQ(record.advanceState(), 0);
    EXPECT_EQ(static_cast<std::uint8_t*>(record.outData)[1], 99);
    EXPECT_EQ(static_cast<std::uint8_t*>(record.inData)[2], 4); // input stays the source
}

// 2 x 1 pixels of 16 bits, planes 0 to 2 of four: numbers 0, 8192, 16384 and so on, all of which come through
// the host's range.
TEST(ImageHost, ConvertsSixteenBitsBothWaysAndLeavesWhatIsNotWritten) {
    Photograph picture = testPhotograph(ColorModel::RgbAlpha, 16, 2, 1, [](std::size_t) { return 0; });
    std::vector<std::uint16_t> samples = {0, 8192, 16384, 1, 32768, 65535, 49152, 65534};
    std::memcpy(picture.samples.data(), samples.data(), picture.samples.size());
    HostedPicture host(picture);
    host::FilterRecord& record = host.record();
    EXPECT_EQ(record.planes, 4);
    EXPECT_EQ(record.filterCase, 4);
    record.outRect = record.filterRect;
    record.outLoPlane = 1;
    record.outHiPlane = 2;
    ASSERT_EQ(record.advanceState(), 0);
    auto* out = static_cast<std::uint16_t*>(record.outData);
    EXPECT_EQ((std::vector<int>(out, out + 4)), (std::vector<int>{4096, 8192, 32768, 24576}));
    out[0] = 16384;
    out[3] = 40000; // above full scale
    record.outRect = {};
    ASSERT_EQ(record.advanceState(), 0);
    samples[1] = 32768;
    samples[6] = 65535;
    EXPECT_EQ(std::memcmp(host.result.samples.data(), samples.data(), 16), 0);
}

TEST(ImageHost, RefusesRequestsOutsideTheImage) {
    HostedPicture host(counting(ColorModel::GreyAlpha, 4, 3));
    host::FilterRecord& record = host.record();
    EXPECT_EQ(record.planes, 1);
    const host::Rect inside = record.filterRect;
    const struct {
        host::Rect area;
        std::int16_t low, high;
    } bad[] = {{{0, 0, 3, 5}, 0, 0}, {{0, 0, 4, 4}, 0, 0}, {{-1, 0, 3, 4}, 0, 0}, {{0, -1, 3, 4}, 0, 0},
               {inside, 0, 1},       {inside, -1, 0},      {inside, 1, 0}};
    for (const auto& request : bad) {
        record.inRect = request.area;
        record.inLoPlane = request.low;
        record.inHiPlane = request.high;
        EXPECT_EQ(record.advanceState(), -50);
        EXPECT_TRUE(record.inData == nullptr);
    }
}

TEST(ImageHost, AnswersForTheYoungest) {
    HostedPicture host(counting(ColorModel::Rgb, 4, 3));
    host.record().inRect = host.record().filterRect;
    {
        const HostedPicture younger(counting(ColorModel::Grey, 1, 1));
        EXPECT_EQ(host.record().advanceState(), 0);
        EXPECT_TRUE(host.record().inData == nullptr);
    }
    EXPECT_EQ(host.record().advanceState(), 0);
    EXPECT_FALSE(host.record().inData == nullptr);
}

} // namespace
