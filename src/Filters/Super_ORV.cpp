#include "Filters/Super_ORV.h"

#include "Utility/Logger.h"

using namespace orvela;

Super_ORV::Super_ORV(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : IFilter(params, inPlane, outPlane) {
    mName = "Super_ORV";
}

bool Super_ORV::PreApply() {
    Log::log(LogLevel::Debug, "Applying Super_ORV filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    const bool tooSmall = mInPlane->height() - 2 <= 2 || mInPlane->width() - 2 <= 2;
    if (!mParams->mSliderParams.OrvelaLevel3Enabled || tooSmall)
        return false;
    Log::log(LogLevel::Debug, "Gauss_denominator%f", static_cast<double>(SmoothingKernel::Gauss_denominator));
    const float level = mParams->mSliderParams.OrvelaLevel3Value / 1000;
    mKernel.emplace(level * 0.3 + 0.05F);
    mVertStart = mRadius + 1;
    mVertEnd = static_cast<std::uint32_t>(mInPlane->height() - mRadius - 1);
    return true;
}

void Super_ORV::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/Super_ORV", 74);
    mKernel->applyRow(*mInPlane, *mOutPlane, static_cast<int>(row), mRadius + 1,
                      mInPlane->width() - mRadius - 1);
}

bool Super_ORV::PostApply() {
    mKernel.reset();
    Log::log(LogLevel::Debug, "Blur Filter complete.");
    return true;
}
