#include "Filters/Super_ORV.h"

#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& Super_ORV::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/Super_ORV",
        .line = 74,
        .dumpName = "Super_ORV",
        .start = "Applying Super_ORV filter from plane at 0x%x to plane at 0x%x...",
        .completion = "Blur Filter complete.",
        .writes = Writes::SomePixels,
    };
    return kDescription;
}

bool Super_ORV::applies() {
    const bool tooSmall = mInPlane->height() - 2 <= 2 || mInPlane->width() - 2 <= 2;
    return mParams->mSliderParams.OrvelaLevel3Enabled && !tooSmall;
}

void Super_ORV::setUp() {
    Log::log(LogLevel::Debug, "Gauss_denominator%f", static_cast<double>(SmoothingKernel::Gauss_denominator));
    const float level = mParams->mSliderParams.OrvelaLevel3Value / 1000;
    mKernel.emplace(level * 0.3 + 0.05F);
    mVertStart = mRadius + 1;
    mVertEnd = static_cast<std::uint32_t>(mInPlane->height() - mRadius - 1);
}

void Super_ORV::ApplyRow(std::uint32_t row) {
    mKernel->applyRow(*mInPlane, *mOutPlane, static_cast<int>(row), mRadius + 1,
                      mInPlane->width() - mRadius - 1);
}
