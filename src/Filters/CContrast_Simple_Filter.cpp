#include "Filters/CContrast_Simple_Filter.h"

#include "Filters/Curves/PivotCurve.h"
#include "Utility/Logger.h"

#include <cmath>

using namespace orvela;

const TaskDescription& CContrast_Simple_Filter::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CContrast_Simple_Filter",
        .line = 91,
        .opening = "Applying CContrast_Simple_Filter from plane at 0x%x to plane at 0x%x...",
    };
    return kDescription;
}

bool CContrast_Simple_Filter::applies() {
    const CSliderParams& s = mParams->mSliderParams;
    return s.ContrastEnabled || s.BrightnessEnabled || s.mContrast_Touch_Enabled ||
           s.mBrightness_Touch_Enabled;
}

void CContrast_Simple_Filter::setUp() {
    const CSliderParams& s = mParams->mSliderParams;
    const bool finalTouch = mParams->Final_Touch_Mode_Enabled;
    if (finalTouch)
        takeValues(s.mContrast_Touch_Enabled, s.mContrast_Touch_Value, s.mBrightness_Touch_Enabled,
                   s.mBrightness_Touch_Value);
    else
        takeValues(s.ContrastEnabled, s.ContrastValue, s.BrightnessEnabled, s.BrightnessValue);
    const bool touched = s.mContrast_Touch_Enabled || s.mBrightness_Touch_Enabled;
    if (finalTouch ? touched : mContrast != 0 || mBrightness != 0)
        Log::log(LogLevel::Debug, "CContrast_Simple_Filter Condition matched.");
    mTable = makeTable([this](int c) {
        const float brightened = std::trunc(PivotCurve::clampAdd(c, mBrightness));
        return PixelMath::trunc(PivotCurve::apply(brightened, mPivot, mContrast));
    });
}

void CContrast_Simple_Filter::takeValues(bool contrastOn, float contrast, bool brightnessOn,
                                         float brightness) {
    if (contrastOn)
        mContrast = static_cast<float>(static_cast<double>(contrast) * 200 / 1000 - 100);
    if (brightnessOn)
        mBrightness = static_cast<float>(static_cast<double>(brightness) * 510 / 1000 - 255);
}

void CContrast_Simple_Filter::mapRow(const PixelRow& row) const {
    mapChannels(mTable, row);
}
