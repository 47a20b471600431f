#pragma once

#include "Filters/IFilter.h"

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
class CTemperature final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    struct Gains {
        float r;
        float g;
        float b;
    };

    void prepareGains();

    std::int32_t mInterval = 0;                 ///< t, 0 to 15
    std::array<Gains, 3 * 255 + 1> mGains = {}; ///< by R + G + B
};
