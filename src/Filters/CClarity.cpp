#include "Filters/CClarity.h"

#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <cmath>

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

const TaskDescription& CClarity::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CClarity",
        .line = 67,
        .dumpName = "CClarity",
        .opening = "Applying CClarity filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CClarity Condition matched.",
        .completion = "CClarity Filter complete.",
    };
    return kDescription;
}

bool CClarity::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.ClarityFilterEnabled && !isAutomaticMode(sliders);
}

void CClarity::setUp() {
    const double value = mParams->mSliderParams.ClarityFilterValue;
    const auto sigma = static_cast<float>(value * 50 / 1000 + 2);
    const float variance = sigma * sigma;
    const auto sloper = static_cast<float>(value <= 600 ? 511 : 1120 - value * 102 / 100);
    mCurves = {curveAround(PixelMath::trunc(mParams->m_OriginalLumaR), variance, sloper),
               curveAround(PixelMath::trunc(mParams->m_OriginalLumaG), variance, sloper),
               curveAround(PixelMath::trunc(mParams->m_OriginalLumaB), variance, sloper)};
    Log::log(LogLevel::Debug, "sloper= %f", static_cast<double>(sloper));
}

void CClarity::mapRow(const PixelRow& row) const {
    mapKeepingHue(mCurves, row);
}
