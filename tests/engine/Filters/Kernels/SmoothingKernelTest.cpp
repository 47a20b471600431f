#include "Filters/Kernels/SmoothingKernel.h"

#include "support/KernelForms.h"

using namespace orvela;

// Noise of little and of full contrast, with black in it, over more than one tile.
TEST(SmoothingKernel, FormsAreTheSame) {
    const auto full = testplanes::noise(561, 24);
    const auto in = testplanes::make(561, 24, [&full](int x, int y) {
        testplanes::Pixel pixel = testplanes::at(*full, x, y);
        for (std::uint8_t& sample : pixel)
            sample =
                kernelforms::level(x < 200 ? sample / 64 + 60 + y : (x < 300 ? 0 : sample / (1 + x % 7)));
        return pixel;
    });
    for (const double threshold : {0.05, 0.08, 0.35}) {
        SCOPED_TRACE(threshold);
        const SmoothingKernel kernel(threshold);
        EXPECT_TRUE(kernelforms::change(
            *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, out, y, 2, 559); },
            [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, out, y, 2, 559); }, 2));
    }
}
