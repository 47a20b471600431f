#include "Histograms/CHistogram_Luma_Final.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

const TaskDescription& CHistogram_Luma_Final::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Histograms/CHistogram_Luma_Final",
        .line = __LINE__,
        .opening = "CHistogram_Luma_Final is starting.",
        .completion = "CHistogram_Luma_Final complete.",
    };
    return kDescription;
}

void CHistogram_Luma_Final::setUp() {
    mSumLuma = 0;
    mSampleCount = 0;
}

void CHistogram_Luma_Final::ApplyRow(std::uint32_t row) {
    RowCounts counts;
    const ConstRow in = std::as_const(*mInPlane).row(static_cast<int>(row));
    for (int x = 0; x < mInPlane->width(); ++x)
        counts.add(in[0][x], in[1][x], in[2][x], PixelMath::lumaOf(in[0][x], in[1][x], in[2][x]));
    merge(counts);
}

void CHistogram_Luma_Final::complete() {
    mParams->m_OriginalLuma = static_cast<float>(mSampleCount == 0 ? 0 : mSumLuma / mSampleCount);
    Log::log(LogLevel::Debug, "m_OriginalLuma  %f", static_cast<double>(mParams->m_OriginalLuma));
}
