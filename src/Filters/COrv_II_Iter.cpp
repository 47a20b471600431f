#include "Filters/COrv_II_Iter.h"

#include "Filters/Kernels/PixelMath.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

COrv_II_Iter::COrv_II_Iter(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : IFilter(params, inPlane, outPlane) {
    mName = "COrv_II_Iter";
}

bool COrv_II_Iter::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    Log::log(LogLevel::Debug, "Applying COrv_II_Iter filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "mSum_Color %f", mParams->mSum_Color);
    mParams->Switch_TOO_SHARP_ORV_II = isTooSharpFor(*mParams, 0.7);
    Log::log(LogLevel::Debug, "Switch_TOO_SHARP_ORV_II %d", mParams->Switch_TOO_SHARP_ORV_II);
    if (mParams->Switch_TOO_SHARP_ORV_II || !sliders.OrvelaLevel2Enabled || !mParams->Normal_Picture ||
        mParams->Under_Exposed_Picture)
        return false;
    Log::log(LogLevel::Debug, "COrv_II_Iter Condition matched.");

    const double level = static_cast<double>(sliders.OrvelaLevel2Value) * 31 / 1000 + 30;
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
    return true;
}

void COrv_II_Iter::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/COrv_II_Iter", 109);
    mKernel->applyRow(*mInPlane, *mOutPlane, static_cast<int>(row));
}

bool COrv_II_Iter::PostApply() {
    mKernel.reset();
    Log::log(LogLevel::Debug, "COrv_II_Iter Filter complete.");
    return true;
}
