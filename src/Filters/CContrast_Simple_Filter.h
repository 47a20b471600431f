#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/RowMapping.h"

/// Contrast and brightness by slider: the brightness -255 to 255 is added, then the value moves away from 127
/// by contrast -100 to 100 (see PivotCurve). Position 500 of either slider is neutral.
///
/// A main run takes ContrastValue and BrightnessValue, a final-touch run mContrast_Touch_Value and
/// mBrightness_Touch_Value; a switch that is off counts as neutral.
class CContrast_Simple_Filter final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;

private:
    void takeValues(bool contrastOn, float contrast, bool brightnessOn, float brightness);

    static constexpr float mPivot = 127;
    float mContrast = 0;
    float mBrightness = 0;
    orvela::ChannelTable mTable = {};
};
