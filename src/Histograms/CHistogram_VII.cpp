#include "Histograms/CHistogram_VII.h"

#include "Utility/Logger.h"

using namespace orvela;

bool CHistogram_VII::PreApply() {
    Log::log(LogLevel::Debug, "CHistogram_VII is starting.");
    prepareSampling();
    return true;
}

void CHistogram_VII::ApplyRow(std::uint32_t row) {
    beginRow(row, "Histograms/CHistogram_VII", __LINE__);
    merge(countSampledRow(row));
}

bool CHistogram_VII::PostApply() {
    scaleBins();
    storeMeans();
    testCast(2);
    testBalance();
    return true;
}

// Holds as soon as one channel mean is above 0: for the largest mean, both others are below 1.4 times it.
void CHistogram_VII::testBalance() const {
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
