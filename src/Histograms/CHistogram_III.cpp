#include "Histograms/CHistogram_III.h"

using namespace orvela;

const TaskDescription& CHistogram_III::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram_III",
        .line = __LINE__,
        .opening = "CHistogram_III is starting.",
    };
    return kDescription;
}

void CHistogram_III::setUp() {
    mParams->Dark_Ave = 0;
    mParams->Middle_Ave = 0;
    mParams->Light_Ave = 0;
    mSumLuma = mSumLumaR = mSumLumaG = mSumLumaB = 0;
    prepareSampling();
}

void CHistogram_III::complete() {
    scaleBins();
    storeMeans();
    mParams->Dark_Ave = bandAverage<std::int32_t>(mLuma, 1, 85);
    mParams->Middle_Ave = bandAverage<std::int32_t>(mLuma, 86, 170);
    mParams->Light_Ave = bandAverage<std::int32_t>(mLuma, 171, 255);
    storeCast(2);
}
