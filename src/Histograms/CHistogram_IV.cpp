#include "Histograms/CHistogram_IV.h"

#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CHistogram_IV::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram_IV",
        .line = __LINE__,
        .opening = "CHistogram_IV is starting.",
    };
    return kDescription;
}

bool CHistogram_IV::applies() {
    return mParams->mSliderParams.mAuto_Color_Enabled;
}

void CHistogram_IV::setUp() {
    logFlags();
    mParams->Dark_Ave = 0;
    mParams->Middle_Ave = 0;
    mParams->Light_Ave = 0;
    prepareSampling();
}

void CHistogram_IV::complete() {
    scaleBins();
    storeMeans();
    mParams->Dark_Ave = bandAverage<double>(mLuma, 1, 85);
    mParams->Middle_Ave = bandAverage<double>(mLuma, 86, 170);
    mParams->Light_Ave = bandAverage<double>(mLuma, 171, 255);
    storeCast(4);
}

void CHistogram_IV::logFlags() const {
    Log::log(LogLevel::Debug, "Auto_Color_Enabled %d", mParams->mSliderParams.mAuto_Color_Enabled);
    Log::log(LogLevel::Debug, "Normal_Picture %d", mParams->Normal_Picture);
    Log::log(LogLevel::Debug, "Dark_middle %d", mParams->Dark_middle);
    Log::log(LogLevel::Debug, "Under_Exposed_Picture %d", mParams->Under_Exposed_Picture);
    Log::log(LogLevel::Debug, "Bicromic %d", mParams->Bicromic);
    Log::log(LogLevel::Debug, "Shift_Level %f", static_cast<double>(mParams->Shift_Level));
}

void CHistogram_IV::StoreResults() {
    CLocalHistogram::StoreResults();
    Log::log(LogLevel::Debug, "CHistogramIV complete.");
    logMeans();
    for (int i = 0; i < 256 && Log::writes(LogLevel::Debug); ++i) {
        const auto bin = static_cast<std::size_t>(i);
        Log::log(LogLevel::Debug, "CHistogram_IV  pHisto_Red[%d] %f", i, mParams->pHisto_Red[bin]);
        Log::log(LogLevel::Debug, "CHistogram_IV   pHisto_Green[%d] %f", i, mParams->pHisto_Green[bin]);
        Log::log(LogLevel::Debug, "CHistogram_IV  pHisto_Blue[%d] %f", i, mParams->pHisto_Blue[bin]);
        Log::log(LogLevel::Debug, "CHistogram_IV  pHisto_Luma[%d] %f", i, mParams->pHisto_Luma[bin]);
    }
}
