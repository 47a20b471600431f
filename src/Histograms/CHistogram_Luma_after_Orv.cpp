#include "Histograms/CHistogram_Luma_after_Orv.h"

using namespace orvela;

const TaskDescription& CHistogram_Luma_after_Orv::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram_Luma_after_Orv",
        .line = __LINE__,
        .opening = "CHistogram_Luma_after_Orv is starting.",
        .matched = "CHistogram_Luma_after_Orv Condition matched.",
    };
    return kDescription;
}

bool CHistogram_Luma_after_Orv::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool iterated = sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled;
    return iterated && mParams->Normal_Picture && !mParams->Under_Exposed_Picture;
}

void CHistogram_Luma_after_Orv::setUp() {
    prepareSampling();
}

void CHistogram_Luma_after_Orv::complete() {
    scaleBins();
    storeMeans();
}
