#include "Histograms/CHistogram_III.h"

#include "Utility/Logger.h"

using namespace orvela;

bool CHistogram_III::PreApply() {
    Log::log(LogLevel::Debug, "CHistogram_III is starting.");
    mParams->Dark_Ave = 0;
    mParams->Middle_Ave = 0;
    mParams->Light_Ave = 0;
    mSumLuma = mSumLumaR = mSumLumaG = mSumLumaB = 0;
    prepareSampling();
    return true;
}

void CHistogram_III::ApplyRow(std::uint32_t row) {
    beginRow(row, "Histograms/CHistogram_III", __LINE__);
    merge(countSampledRow(row));
}

bool CHistogram_III::PostApply() {
    scaleBins();
    storeMeans();
    mParams->Dark_Ave = bandAverage<std::int32_t>(mLuma, 1, 85);
    mParams->Middle_Ave = bandAverage<std::int32_t>(mLuma, 86, 170);
    mParams->Light_Ave = bandAverage<std::int32_t>(mLuma, 171, 255);
    testCast(2);
    return true;
}
