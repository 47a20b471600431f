#include "Filters/Kernels/IlluminationKernel.h"

#include "support/KernelForms.h"

using namespace orvela;

TEST(IlluminationKernel, FormsAreTheSame) {
    const auto in = testplanes::noise(301, 40);
    for (const float epsilon : {75.0F, 90.0F, 114.0F, 153.0F}) {
        SCOPED_TRACE(epsilon);
        const IlluminationKernel kernel(epsilon, 100'000'000); // of so many pixels a table pays
        kernelforms::change(
            *in, [&](CARGBPlane& out, int y) { kernel.applyRow(*in, out, y); },
            [&](CARGBPlane& out, int y) { kernel.applyRowPlain(*in, out, y); });
    }
}
