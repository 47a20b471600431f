#include "Filters/CClarity.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <cmath>
#include <utility>

using namespace orvela;

namespace {

WideTable curveAround(int mean, float variance, float sloper) {
    return makeTable<WideTable>([=](int c) {
        const int d = c - mean;
        const double weight = static_cast<float>(std::exp(-std::abs(d) / (2.0 * variance)) * d);
        const double value = d >= 0 ? (255 - c) * weight / sloper + c : c - (255 - c) * weight / 511;
        return PixelMath::trunc(static_cast<float>(value));
    });
}

} // namespace

CClarity::CClarity(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : IFilter(params, inPlane, outPlane) {
    mName = "CClarity";
}

bool CClarity::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    if (!sliders.ClarityFilterEnabled || isAutomaticMode(sliders))
        return false;
    Log::log(LogLevel::Debug, "Applying CClarity filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "CClarity Condition matched.");
    const double value = sliders.ClarityFilterValue;
    const auto sigma = static_cast<float>(value * 50 / 1000 + 2);
    const float variance = sigma * sigma;
    const auto sloper = static_cast<float>(value <= 600 ? 511 : 1120 - value * 102 / 100);
    mCurves = {curveAround(PixelMath::trunc(mParams->m_OriginalLumaR), variance, sloper),
               curveAround(PixelMath::trunc(mParams->m_OriginalLumaG), variance, sloper),
               curveAround(PixelMath::trunc(mParams->m_OriginalLumaB), variance, sloper)};
    Log::log(LogLevel::Debug, "sloper= %f", static_cast<double>(sloper));
    return true;
}

void CClarity::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CClarity", 67);
    const int y = static_cast<int>(row);
    mapKeepingHue(mCurves, std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width());
}

bool CClarity::PostApply() {
    Log::log(LogLevel::Debug, "CClarity Filter complete.");
    return true;
}
