// The fast form of every kernel gives the bytes of its plain form.

#include "Filters/Kernels/BilateralKernel.h"
#include "Filters/Kernels/IlluminationKernel.h"
#include "Filters/Kernels/MoireKernel.h"
#include "Filters/Kernels/SaturationKernel.h"
#include "Filters/Kernels/SmoothingKernel.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>

using namespace orvela;

namespace {

using testplanes::bytes;
using testplanes::noise;
using testplanes::Pixel;
using testplanes::uniform;
using Picture = std::unique_ptr<CARGBPlane>;

std::uint8_t level(double value) {
    return static_cast<std::uint8_t>(std::clamp(value, 0.0, 255.0));
}

// Soft waves with edges and a little noise, as in a photograph.
Picture waves(int width, int height) {
    const Picture grain = noise(width, height, 3);
    return testplanes::make(width, height, [&grain](int x, int y) {
        Pixel pixel = testplanes::at(*grain, x, y);
        const double light = 120 + 80 * std::sin(x * 0.07) * std::cos(y * 0.31) + (x % 40 < 20 ? 35 : -35);
        for (std::uint8_t& sample : pixel)
            sample = level(light + sample / 16);
        return pixel;
    });
}

// Both forms, as functions of a picture to change and a row, give the same; whether that is another picture.
template <typename Fast, typename Plain>
bool formsChange(const CARGBPlane& in, const Fast& fast, const Plain& plain, int border = 0) {
    CARGBPlane tiled(in, QStringLiteral("tiled"));
    CARGBPlane single(in, QStringLiteral("plain"));
    for (int y = border; y < in.height() - border; ++y) {
        fast(tiled, y);
        plain(single, y);
    }
    EXPECT_TRUE(bytes(tiled) == bytes(single)) << in.width() << 'x' << in.height();
    return bytes(tiled) != bytes(in);
}

std::vector<float> decay(std::size_t count, double variance) {
    std::vector<float> table(count);
    for (std::size_t i = 0; i < count; ++i)
        table[i] = static_cast<float>(std::exp(-static_cast<double>(i) / variance));
    return table;
}

TEST(KernelForms, Bilateral) {
    const std::vector<float> range = decay(195076, 1125);
    for (const auto& [w, h] : {std::pair{2, 3}, {3, 3}, {258, 9}, {259, 9}, {777, 40}}) {
        for (const Picture& in : {noise(w, h), waves(w, h), uniform(w, h, {0, 0, 0}),
                                  uniform(w, h, {255, 255, 255}), uniform(w, h, {255, 0, 9})}) {
            for (const double variance : {0.25, 4.0, 25.0}) {
                SCOPED_TRACE(variance);
                const std::vector<float> spatial = decay(3, variance);
                const BilateralKernel kernel(spatial.data(), range.data());
                formsChange(
                    *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, out, y); },
                    [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, out, y); }, 1);
            }
        }
    }
}

// Each channel moved by 13 to 19 levels either way: about the limit of the moire filter.
Picture moved(const CARGBPlane& from) {
    return testplanes::make(from.width(), from.height(), [&from](int x, int y) {
        Pixel pixel = testplanes::at(from, x, y);
        for (std::uint8_t& sample : pixel)
            sample = level(sample + (13 + (x + 3 * y) % 7) * (x % 5 < 3 ? 1 : -1));
        return pixel;
    });
}

TEST(KernelForms, Moire) {
    for (const auto& [w, h] : {std::pair{1, 1}, {4, 9}, {5, 6}, {6, 5}, {7, 7}, {261, 12}, {530, 9}}) {
        for (const Picture& in : {noise(w, h), waves(w, h), uniform(w, h, {100, 100, 100}),
                                  uniform(w, h, {0, 0, 0}), uniform(w, h, {255, 255, 255})}) {
            for (const Picture& host : {moved(*in), noise(w, h, 5)}) {
                for (const float position : {0.0F, 333.0F, 1000.0F}) {
                    SCOPED_TRACE(position);
                    const MoireKernel kernel(position);
                    const auto rows = [&host](int y) { return std::as_const(*host).row(y); };
                    const bool changed = formsChange(
                        *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, rows(y), out, y); },
                        [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, rows(y), out, y); });
                    EXPECT_TRUE(changed || w <= 7);
                }
            }
        }
    }
}

// Every fourth level and the ends, in all combinations: every hue, range and saturation, greys and black too.
TEST(KernelForms, Saturation) {
    const auto colour = [](int x, int y) {
        return Pixel{level(4 * x), level(4 * (y % 65)), level(4 * (y / 65))};
    };
    using Change = SaturationKernel::Change;
    for (const Picture& in :
         {testplanes::make(65, 65 * 65, colour), noise(777, 200), noise(256, 9), noise(1, 3)}) {
        for (const auto& [change, alfa] : {std::pair{Change::Lower, 1.0F},
                                           {Change::Lower, 0.3F},
                                           {Change::Raise, 0.402F},
                                           {Change::Raise, 1.2F}}) {
            SCOPED_TRACE(alfa);
            const SaturationKernel kernel(change, alfa);
            const auto row = [&in](CARGBPlane& out, int y) {
                return PixelRow{y, in->width(), std::as_const(*in).row(y), out.row(y)};
            };
            formsChange(
                *in, [&](CARGBPlane& out, int y) { kernel.applyRow(row(out, y)); },
                [&](CARGBPlane& out, int y) { kernel.applyRowPlain(row(out, y)); });
        }
    }
}

TEST(KernelForms, Illumination) {
    const Picture in = noise(301, 40);
    for (const float epsilon : {75.0F, 90.0F, 114.0F, 153.0F}) {
        SCOPED_TRACE(epsilon);
        const IlluminationKernel kernel(epsilon, 100'000'000);
        formsChange(
            *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, out, y); },
            [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, out, y); });
    }
}

// Noise of little and of full contrast, with black in it, over more than one tile.
TEST(KernelForms, Smoothing) {
    const Picture full = noise(561, 24);
    const Picture in = testplanes::make(561, 24, [&full](int x, int y) {
        Pixel pixel = testplanes::at(*full, x, y);
        for (std::uint8_t& sample : pixel)
            sample = level(x < 200 ? sample / 64 + 60 + y : (x < 300 ? 0 : sample / (1 + x % 7)));
        return pixel;
    });
    for (const double threshold : {0.05, 0.08, 0.35}) {
        SCOPED_TRACE(threshold);
        const SmoothingKernel kernel(threshold);
        EXPECT_TRUE(formsChange(
            *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, out, y, 2, 559); },
            [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, out, y, 2, 559); }, 2));
    }
}

} // namespace
