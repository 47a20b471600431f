#include "Filters/CGamma_Simple_Filter.h"

#include "Filters/Curves/GammaCurve.h"
#include "Filters/Curves/LevelMath.h"
#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

bool CGamma_Simple_Filter::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    if (!sliders.GammaCorrectionEnabled)
        return false;
    Log::log(LogLevel::Debug, "Applying Gamma_Simple_Filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "CGamma_Simple_Filter Condition matched.");
    mTable = GammaCurve::table(LevelMath::sliderToGamma(sliders.GammaCorrectionValue));
    return true;
}

void CGamma_Simple_Filter::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CGamma_Simple_Filter", 63);
    const int y = static_cast<int>(row);
    mapRow(mTable, std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width());
}

bool CGamma_Simple_Filter::PostApply() {
    Log::log(LogLevel::Debug, "CGamma_Simple_Filter Filter complete.");
    return true;
}
