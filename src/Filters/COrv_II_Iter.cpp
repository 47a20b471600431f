#include "Filters/COrv_II_Iter.h"

#include "Filters/Kernels/PixelMath.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& COrv_II_Iter::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/COrv_II_Iter",
        .line = 109,
        .dumpName = "COrv_II_Iter",
        .start = "Applying COrv_II_Iter filter from plane at 0x%x to plane at 0x%x...",
        .matched = "COrv_II_Iter Condition matched.",
        .completion = "COrv_II_Iter Filter complete.",
    };
    return kDescription;
}

bool COrv_II_Iter::applies() {
    storeSharpnessSwitch();
    return !mParams->Switch_TOO_SHARP_ORV_II && mParams->mSliderParams.OrvelaLevel2Enabled &&
           mParams->Normal_Picture && !mParams->Under_Exposed_Picture;
}

void COrv_II_Iter::storeSharpnessSwitch() {
    Log::log(LogLevel::Debug, "mSum_Color %f", mParams->mSum_Color);
    mParams->Switch_TOO_SHARP_ORV_II = isTooSharpFor(*mParams, 0.7);
    Log::log(LogLevel::Debug, "Switch_TOO_SHARP_ORV_II %d", mParams->Switch_TOO_SHARP_ORV_II);
}

void COrv_II_Iter::setUp() {
    const double level = static_cast<double>(mParams->mSliderParams.OrvelaLevel2Value) * 31 / 1000 + 30;
    const auto lightness = static_cast<float>(PixelMath::trunc(level));
    const auto dEpsilon2 = static_cast<float>(PixelMath::trunc(2 * lightness));
    const double light = static_cast<double>(lightness) / 1.275F;
    mParams->OrvelaLight2 = static_cast<float>(PixelMath::trunc(light));
    if (light > 70)
        mParams->Soft_Orvela = false;
    mKernel.emplace(dEpsilon2, mInPlane->pixelCount());

    Log::log(LogLevel::Debug, "Orvela_Lightness %f", static_cast<double>(lightness));
    Log::log(LogLevel::Debug, "dEpsilon2  %f", static_cast<double>(dEpsilon2));
    Log::log(LogLevel::Debug, "mSum_Color  %f", mParams->mSum_Color);
}

void COrv_II_Iter::ApplyRow(std::uint32_t row) {
    mKernel->applyRow(*mInPlane, *mOutPlane, static_cast<int>(row));
}
