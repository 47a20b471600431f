#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Contrast and brightness by slider: the brightness -255 to 255 is added, then the value moves away from 127
/// by contrast -100 to 100 (see PivotCurve). Position 500 of either slider is neutral.
///
/// A main run takes ContrastValue and BrightnessValue, a final-touch run mContrast_Touch_Value and
/// mBrightness_Touch_Value; a switch that is off counts as neutral.
class CContrast_Simple_Filter final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void takeValues(bool contrastOn, float contrast, bool brightnessOn, float brightness);

    static constexpr float mPivot = 127;
    float mContrast = 0;
    float mBrightness = 0;
    orvela::ChannelTable mTable = {};
};
