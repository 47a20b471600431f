#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Colour filter: tints every pixel toward a chosen colour T, then restores the pixel's mean brightness.
///
///     c' = trunc(T * v + c * (1 - v)),   c'' = trunc(c' * trunc(mean(c)) / mean(c'))
///
/// v is the intensity / 1000, 0 to 1; results above 255 are rescaled with their hue. Main runs use the
/// colour filter's colour and intensity, final-touch runs the touch colour and intensity.
class CColor final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    orvela::WideTables mTint = {}; ///< of the channels, before the brightness is restored
};
