#include "Histograms/CHistogram0.h"

#include "Filters/Kernels/PixelMath.h"

#include <cstdlib>
#include <utility>

using namespace orvela;

namespace {

// Mean absolute difference of the channels.
float greySpread(int r, int g, int b) {
    return static_cast<float>(std::abs(g - b) + std::abs(r - b) + std::abs(r - g)) / 3;
}

} // namespace

const TaskDescription& CHistogram0::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram0",
        .line = __LINE__,
    };
    return kDescription;
}

void CHistogram0::setUp() {
    mWhite = 0;
    mBlack = 0;
    mSampleCount = 0;
    prepareSampling();
}

void CHistogram0::ApplyRow(std::uint32_t row) {
    RowCounts counts = countSampledRow(row);
    countGreys(row, counts);
    merge(counts, true);
}

void CHistogram0::countGreys(std::uint32_t row, RowCounts& counts) const {
    const ConstRow in = mInPlane->row(static_cast<int>(row));
    for (int x = 0; x < mInPlane->width() - mHistoStep; x += mHistoStep) {
        const std::uint32_t luma = PixelMath::lumaOf(in[0][x], in[1][x], in[2][x]);
        if (greySpread(in[0][x], in[1][x], in[2][x]) >= 30)
            continue;
        counts.white += luma > 230;
        counts.black += luma < 20;
    }
}

void CHistogram0::complete() {
    scaleBins();
    storeBandShares();
    mParams->m_Histo_Light_Exception = HighlightShares<double>::of(mRed, mGreen, mBlue, pixels()).flag();
    storeMeans();
}

void CHistogram0::storeBandShares() {
    mParams->m_Dark_Acu = sumOf(mLuma, 1, 85) / pixels();
    mParams->m_Middle_Acu = sumOf(mLuma, 86, 170) / pixels();
    mParams->m_Light_Acu = sumOf(mLuma, 220, 255) / pixels();
}

void CHistogram0::storeMeans() {
    const auto mean = [this](std::uint32_t sum) {
        return static_cast<float>(mSampleCount == 0 ? 0 : sum / mSampleCount);
    };
    mParams->m_OriginalLuma0 = mean(mSumLuma);
    mParams->m_OriginalLumaR0 = mean(mSumLumaR);
    mParams->m_OriginalLumaG0 = mean(mSumLumaG);
    mParams->m_OriginalLumaB0 = mean(mSumLumaB);
}
