#include "Histograms/CHistogram_Luma_Final.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

bool CHistogram_Luma_Final::PreApply() {
    Log::log(LogLevel::Debug, "CHistogram_Luma_Final is starting.");
    mSumLuma = 0;
    mSampleCount = 0;
    return true;
}

void CHistogram_Luma_Final::ApplyRow(std::uint32_t row) {
    beginRow(row, "Histograms/CHistogram_Luma_Final", __LINE__);
    RowCounts counts;
    const ConstRow in = std::as_const(*mInPlane).row(static_cast<int>(row));
    for (int x = 0; x < mInPlane->width(); ++x)
        counts.add(in[0][x], in[1][x], in[2][x], PixelMath::lumaOf(in[0][x], in[1][x], in[2][x]));
    merge(counts);
}

bool CHistogram_Luma_Final::PostApply() {
    mParams->m_OriginalLuma = static_cast<float>(mSampleCount == 0 ? 0 : mSumLuma / mSampleCount);
    Log::log(LogLevel::Debug, "m_OriginalLuma  %f", static_cast<double>(mParams->m_OriginalLuma));
    Log::log(LogLevel::Debug, "CHistogram_Luma_Final complete.");
    return true;
}
