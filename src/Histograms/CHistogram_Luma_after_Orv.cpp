#include "Histograms/CHistogram_Luma_after_Orv.h"

#include "Utility/Logger.h"

using namespace orvela;

bool CHistogram_Luma_after_Orv::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool iterated = sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled;
    if (!iterated || !mParams->Normal_Picture || mParams->Under_Exposed_Picture)
        return false;
    Log::log(LogLevel::Debug, "CHistogram_Luma_after_Orv is starting.");
    Log::log(LogLevel::Debug, "CHistogram_Luma_after_Orv Condition matched.");
    prepareSampling();
    return true;
}

void CHistogram_Luma_after_Orv::ApplyRow(std::uint32_t row) {
    beginRow(row, "Histograms/CHistogram_Luma_after_Orv", __LINE__);
    merge(countSampledRow(row));
}

bool CHistogram_Luma_after_Orv::PostApply() {
    scaleBins();
    storeMeans();
    return true;
}
