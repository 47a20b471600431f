#include "PluginEntry/Exchange/CARGBPlanePhotoshop.h"

#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"

#include <gtest/gtest.h>

#include <cstring>
#include <vector>

using namespace orvela;

namespace {

/// A host whose buffers are the image's own planes, each with padded rows of `stride` samples.
template <typename Sample>
struct PlaneHost {
    PlaneHost(int width, int height, std::vector<std::vector<Sample>> samples) : planes(std::move(samples)) {
        record.planes = static_cast<std::int16_t>(planes.size());
        record.depth = 8 * sizeof(Sample);
        record.filterRect = {0, 0, static_cast<std::int16_t>(height), static_cast<std::int16_t>(width)};
        stride = width;
        active = this;
        record.advanceState = [] { return active->advance(); };
    }
    std::int16_t advance() {
        ++calls;
        const auto data = [&](const host::Rect& area, int plane) -> void* {
            return area.right == 0 ? nullptr
                                   : &planes.at(static_cast<std::size_t>(
                                         plane))[static_cast<std::size_t>(area.top * stride + area.left)];
        };
        record.inData = data(record.inRect, record.inLoPlane);
        record.outData = data(record.outRect, record.outLoPlane);
        record.inRowBytes = record.outRowBytes = stride * static_cast<int>(sizeof(Sample));
        return 0;
    }
    void fill(CARGBPlanePhotoshop& plane) { plane.FillFrom_Photoshop_Data(&record, &result); }
    void write(CARGBPlanePhotoshop& plane) { plane.copyPlaneToPS(&record, &result); }

    static inline PlaneHost* active = nullptr;
    host::FilterRecord record{};
    std::vector<std::vector<Sample>> planes;
    int stride = 0;
    int calls = 0;
    std::int16_t result = 0;
};

using Bytes = std::vector<std::uint8_t>;
using Words = std::vector<std::uint16_t>;

Bytes channel(CARGBPlanePhotoshop& plane, Channel which) {
    return {plane.samples(which), plane.samples(which) + plane.pixelCount()};
}

TEST(CARGBPlanePhotoshop, MapsSixteenBitsDownByTheFloorAndUpToFullScale) {
    PlaneHost<std::uint16_t> host(
        4, 1, {{0, 128, 32767, 32768}, {129, 257, 16384, 1}, {32769, 32896, 32897, 65535}});
    CARGBPlanePhotoshop plane(0, 0, QStringLiteral("plane"));
    host.fill(plane);
    EXPECT_EQ(channel(plane, Channel::Red), (Bytes{0, 0, 254, 255}));
    EXPECT_EQ(channel(plane, Channel::Green),
              (Bytes{1, 1, 127, 0})); // 129 * 255 / 32768 = 1.004, 257 gives 1.99
    EXPECT_EQ(channel(plane, Channel::Blue), Bytes(4, 255)) << "above full scale";
    const Bytes out = {0, 1, 128, 255};
    std::copy(out.begin(), out.end(), plane.samples(Channel::Blue));
    host.write(plane);
    EXPECT_EQ(host.planes[2], (Words{0, 128, 16448, 32768}));
}

TEST(CARGBPlanePhotoshop, TakesGreyFromRedAndMakesTransparencyOpaque) {
    PlaneHost<std::uint8_t> host(2, 1, {{10, 20}, {100, 0}});
    CARGBPlanePhotoshop plane(0, 0, QStringLiteral("plane"));
    host.fill(plane);
    EXPECT_EQ(plane.colorMode(), CARGBPlane::Grayscale);
    for (const Channel which : kChannels)
        EXPECT_EQ(channel(plane, which), (Bytes{10, 20}));
    plane.samples(Channel::Red)[0] = 1;
    plane.samples(Channel::Blue)[0] = 3;
    host.write(plane);
    EXPECT_EQ(host.planes, (std::vector<Bytes>{{3, 20}, {255, 255}}));

    PlaneHost<std::uint8_t> single(2, 1, {{10, 20}});
    single.fill(plane);
    plane.samples(Channel::Red)[0] = 1;
    plane.samples(Channel::Blue)[0] = 3;
    single.write(plane);
    EXPECT_EQ(single.planes[0], (Bytes{1, 20}));
}

TEST(CARGBPlanePhotoshop, TakesAndReturnsAnEmptyRectangle) {
    for (const std::int16_t height : {0, 5}) {
        PlaneHost<std::uint8_t> host(0, height, {{}});
        CARGBPlanePhotoshop plane(3, 3, QStringLiteral("plane"));
        LogCapture log;
        host.fill(plane);
        EXPECT_TRUE(log.has("Grayscale mode."));
        EXPECT_EQ(plane.pixelCount(), 0);
        host.write(plane);
        EXPECT_EQ(host.result, 0);
    }
}

// Transparency or black: neither read nor written. Two rows of three, of which a rectangle of two pixels.
TEST(CARGBPlanePhotoshop, StaysInsideTheRectangleAndTheFirstThreeChannels) {
    PlaneHost<std::uint8_t> host(3, 2, {{1, 2, 3, 4, 5, 6}, Bytes(6, 7), Bytes(6, 8), Bytes(6, 9)});
    host.record.filterRect = {0, 1, 2, 2};
    CARGBPlanePhotoshop plane(0, 0, QStringLiteral("plane"));
    host.fill(plane);
    EXPECT_EQ(plane.width(), 1);
    EXPECT_EQ(plane.height(), 2);
    EXPECT_EQ(plane.colorMode(), CARGBPlane::Color);
    EXPECT_EQ(channel(plane, Channel::Red), (Bytes{2, 5}));
    for (const Channel which : kChannels)
        std::memset(plane.samples(which), 50 + static_cast<int>(which), 2);
    host.write(plane);
    EXPECT_EQ(
        host.planes,
        (std::vector<Bytes>{{1, 50, 3, 4, 50, 6}, {7, 51, 7, 7, 51, 7}, {8, 52, 8, 8, 52, 8}, Bytes(6, 9)}));
    EXPECT_EQ(host.calls, 4 + 4);
    EXPECT_EQ(host.record.outRect.right, 0);
}

TEST(CARGBPlanePhotoshop, RefusesFivePlanesBeforeAnyRequest) {
    PlaneHost<std::uint8_t> five(1, 1, std::vector<Bytes>(5, Bytes(1)));
    CARGBPlanePhotoshop plane(1, 1, QStringLiteral("plane"));
    EXPECT_THROW(five.write(plane), CGenericEx);
    EXPECT_EQ(five.calls, 0);
}

} // namespace
