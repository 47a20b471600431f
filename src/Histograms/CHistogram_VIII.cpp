#include "Histograms/CHistogram_VIII.h"

using namespace orvela;

const TaskDescription& CHistogram_VIII::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram_VIII",
        .line = __LINE__,
        .opening = "CHistogram_VIII is starting.",
    };
    return kDescription;
}

bool CHistogram_VIII::applies() {
    return mParams->mSliderParams.DigitalFlashEnabled;
}

void CHistogram_VIII::setUp() {
    prepareSampling();
}

void CHistogram_VIII::complete() {
    scaleBins();
    storeMeans();
    mParams->m_Histo_Light_Exception = HighlightShares<float>::of(mRed, mGreen, mBlue, pixels()).flag();
}
