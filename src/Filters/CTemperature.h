#pragma once

#include "Filters/PointFilter.h"

#include <array>

/// Shifts the colour balance toward the temperature T = Temperature_Value * 8 + 2000 K (2000 to 10000) and
/// keeps each pixel's sum R + G + B. Pixels with a mean brightness of at most 30 are left alone.
///
/// T selects one of sixteen intervals of equal steps in 1 / T; its index t gives the chromaticity
///
///     x = 2 t^3 / 140000 - 0.0008 t^2 - 0.0081 t + 0.5349
///     y = 0.0046 t - (t^3 / 140000 + 0.0007 t^2) + 0.4083
///
/// where 140000 brings the sixteen points closest to the Planckian locus. Channel gains are one plus the
/// normalised linear components of that colour at the pixel's brightness.
class CTemperature final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    struct Gains {
        double r;
        double g;
        double b;
    };

    void prepareGains();

    std::int32_t mInterval = 0;                 ///< t, 0 to 15
    std::array<Gains, 3 * 255 + 1> mGains = {}; ///< by R + G + B
};
