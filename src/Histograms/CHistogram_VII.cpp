#include "Histograms/CHistogram_VII.h"

#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CHistogram_VII::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram_VII",
        .line = __LINE__,
        .opening = "CHistogram_VII is starting.",
    };
    return kDescription;
}

void CHistogram_VII::setUp() {
    prepareSampling();
}

void CHistogram_VII::complete() {
    scaleBins();
    storeMeans();
    storeCast(2);
    storeBalance();
}

// Holds as soon as one channel mean is above 0: for the largest mean, both others are below 1.4 times it.
void CHistogram_VII::storeBalance() {
    const double r = mParams->m_OriginalLumaR;
    const double g = mParams->m_OriginalLumaG;
    const double b = mParams->m_OriginalLumaB;
    const bool nearBlue = r < 1.4 * b && g < 1.4 * b;
    const bool nearGreen = r < 1.4 * g && b < 1.4 * g;
    const bool nearRed = g < 1.4 * r && b < 1.4 * r;
    if (nearBlue || nearGreen || nearRed)
        mParams->Bicromic = true;
}

void CHistogram_VII::StoreResults() {
    CLocalHistogram::StoreResults();
    Log::log(LogLevel::Debug, "CHistogram_VII complete.");
    logMeans();
}
