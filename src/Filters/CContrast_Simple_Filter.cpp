#include "Filters/CContrast_Simple_Filter.h"

#include "Filters/Curves/PivotCurve.h"
#include "Utility/Logger.h"

#include <cmath>
#include <utility>

using namespace orvela;

bool CContrast_Simple_Filter::PreApply() {
    const CSliderParams& s = mParams->mSliderParams;
    const bool touch = s.mContrast_Touch_Enabled || s.mBrightness_Touch_Enabled;
    if (!s.ContrastEnabled && !s.BrightnessEnabled && !touch)
        return false;
    Log::log(LogLevel::Debug, "Applying CContrast_Simple_Filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    if (finalTouch)
        takeValues(s.mContrast_Touch_Enabled, s.mContrast_Touch_Value, s.mBrightness_Touch_Enabled,
                   s.mBrightness_Touch_Value);
    else
        takeValues(s.ContrastEnabled, s.ContrastValue, s.BrightnessEnabled, s.BrightnessValue);
    if (finalTouch ? touch : mContrast != 0 || mBrightness != 0)
        Log::log(LogLevel::Debug, "CContrast_Simple_Filter Condition matched.");
    mTable = makeTable([this](int c) {
        const float brightened = std::trunc(PivotCurve::clampAdd(c, mBrightness));
        return PixelMath::trunc(PivotCurve::apply(brightened, mPivot, mContrast));
    });
    return true;
}

void CContrast_Simple_Filter::takeValues(bool contrastOn, float contrast, bool brightnessOn,
                                         float brightness) {
    if (contrastOn)
        mContrast = static_cast<float>(static_cast<double>(contrast) * 200 / 1000 - 100);
    if (brightnessOn)
        mBrightness = static_cast<float>(static_cast<double>(brightness) * 510 / 1000 - 255);
}

void CContrast_Simple_Filter::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CContrast_Simple_Filter", 91);
    const int y = static_cast<int>(row);
    mapRow(mTable, std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width());
}
