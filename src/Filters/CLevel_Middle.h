#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/PointFilter.h"

/// Absolute midtones: multiplies by the ratio by which a gamma would move the mean luma.
///
///     ratio = 255 * (trunc(mean) / 255)^(1 / g) / mean,   g = 0.1 (position 0) to 10 (1000), neutral 500
///
/// A main run uses mAbsolute_Middle_Value and the mean luma; a final-touch run mMiddle_Touch_Value_RGB, then
/// each channel's own value and mean. Too bright pixels keep their hue. Stays away in automatic colour.
class CLevel_Middle final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void prepareMain();
    void prepareTouch();

    orvela::WideTables mMaps = {};
};
