#include "Histograms/CHistogram_VIII.h"

#include "Utility/Logger.h"

using namespace orvela;

bool CHistogram_VIII::PreApply() {
    if (!mParams->mSliderParams.DigitalFlashEnabled)
        return false;
    Log::log(LogLevel::Debug, "CHistogram_VIII is starting.");
    prepareSampling();
    return true;
}

void CHistogram_VIII::ApplyRow(std::uint32_t row) {
    beginRow(row, "Histograms/CHistogram_VIII", __LINE__);
    merge(countSampledRow(row));
}

bool CHistogram_VIII::PostApply() {
    scaleBins();
    storeMeans();
    mParams->m_Histo_Light_Exception = HighlightShares<float>::of(mRed, mGreen, mBlue, pixels()).flag();
    return true;
}
