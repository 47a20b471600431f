#include "Filters/Kernels/BilateralKernel.h"

#include "support/KernelForms.h"

using namespace orvela;

namespace {

using namespace testplanes;

std::vector<float> decay(std::size_t count, double variance) {
    std::vector<float> table(count);
    for (std::size_t i = 0; i < count; ++i)
        table[i] = static_cast<float>(std::exp(-static_cast<double>(i) / variance));
    return table;
}

TEST(BilateralKernel, FormsAreTheSame) {
    const std::vector<float> range = decay(195076, 1125);
    for (const auto& [w, h] : {std::pair{2, 3}, {3, 3}, {258, 9}, {259, 9}, {777, 40}}) {
        for (const auto& in : {noise(w, h), kernelforms::waves(w, h), uniform(w, h, {0, 0, 0}),
                               uniform(w, h, {255, 255, 255}), uniform(w, h, {255, 0, 9})}) {
            for (const double variance : {0.25, 4.0, 25.0}) {
                SCOPED_TRACE(variance);
                const std::vector<float> spatial = decay(3, variance);
                const BilateralKernel kernel(spatial.data(), range.data());
                kernelforms::change(
                    *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, out, y); },
                    [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, out, y); }, 1);
            }
        }
    }
}

} // namespace
