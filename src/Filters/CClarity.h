#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Clarity: brightens each channel by its distance d from the picture's channel mean, most at a moderate
/// distance, least near white.
///
///     T(d) = exp(-|d| / (2 s^2)) * d,   s = ClarityFilterValue * 50 / 1000 + 2
///     d >= 0: c' = c + (255 - c) * T(d) / sloper,   d < 0: c' = c - (255 - c) * T(d) / 511
///
/// sloper is 511 up to position 600 and falls to 100 at 1000. Results above 255 are rescaled with their hue.
class CClarity final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    orvela::WideTables mCurves = {};
};
