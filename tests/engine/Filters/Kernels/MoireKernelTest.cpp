#include "Filters/Kernels/MoireKernel.h"

#include "support/KernelForms.h"

using namespace orvela;

namespace {

using namespace testplanes;

// Each channel moved by 13 to 19 levels either way: about the limit of the filter.
std::unique_ptr<CARGBPlane> moved(const CARGBPlane& from) {
    return make(from.width(), from.height(), [&from](int x, int y) {
        Pixel pixel = at(from, x, y);
        for (std::uint8_t& sample : pixel)
            sample = kernelforms::level(sample + (13 + (x + 3 * y) % 7) * (x % 5 < 3 ? 1 : -1));
        return pixel;
    });
}

TEST(MoireKernel, FormsAreTheSame) {
    for (const auto& [w, h] : {std::pair{1, 1}, {4, 9}, {5, 6}, {6, 5}, {7, 7}, {261, 12}, {530, 9}}) {
        for (const auto& in : {noise(w, h), kernelforms::waves(w, h), uniform(w, h, {100, 100, 100}),
                               uniform(w, h, {0, 0, 0}), uniform(w, h, {255, 255, 255})}) {
            for (const auto& host : {moved(*in), noise(w, h, 5)}) {
                for (const float position : {0.0F, 333.0F, 1000.0F}) {
                    SCOPED_TRACE(position);
                    const MoireKernel kernel(position);
                    const auto rows = [&host](int y) { return std::as_const(*host).row(y); };
                    const bool changed = kernelforms::change(
                        *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, rows(y), out, y); },
                        [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, rows(y), out, y); });
                    EXPECT_TRUE(changed || w <= 7);
                }
            }
        }
    }
}

} // namespace
