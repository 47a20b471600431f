#include "Filters/Kernels/SaturationKernel.h"

#include "support/KernelForms.h"

using namespace orvela;

namespace {

using namespace testplanes;

// Every fourth level and the ends, in all combinations: every hue, range and saturation, greys and black too.
TEST(SaturationKernel, FormsAreTheSame) {
    const auto colour = [](int x, int y) {
        return Pixel{kernelforms::level(4 * x), kernelforms::level(4 * (y % 65)),
                     kernelforms::level(4 * (y / 65))};
    };
    using Change = SaturationKernel::Change;
    for (const auto& in : {make(65, 65 * 65, colour), noise(777, 200), noise(256, 9), noise(1, 3)}) {
        for (const auto& [change, alfa] : {std::pair{Change::Lower, 1.0F},
                                           {Change::Lower, 0.3F},
                                           {Change::Raise, 0.402F},
                                           {Change::Raise, 1.2F}}) {
            SCOPED_TRACE(alfa);
            const SaturationKernel kernel(change, alfa);
            const auto row = [&in](CARGBPlane& out, int y) {
                return PixelRow{y, in->width(), std::as_const(*in).row(y), out.row(y)};
            };
            kernelforms::change(
                *in, [&](CARGBPlane& out, int y) { kernel.applyRow(row(out, y)); },
                [&](CARGBPlane& out, int y) { kernel.applyRowPlain(row(out, y)); });
        }
    }
}

} // namespace
