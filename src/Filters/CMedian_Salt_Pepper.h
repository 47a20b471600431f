#pragma once

#include "Filters/IFilter.h"

/// Spot filter: brings isolated bright spots down to the local median of the brightness, keeping their hue.
/// The window is the pixel and its left, upper and upper-left neighbours, the median the third smallest of
/// the four. A pixel is a spot when its brightness is at least 101 and above trunc(mean of the window * f),
///
///     f = 2 - SaltPepperValue * 1.9 / 1000,   or 0.5 in pictures marked as dark in the middle.
///
/// Dark spots and the one-pixel border are left alone.
class CMedian_Salt_Pepper final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;

private:
    static constexpr std::int32_t mRadius = 1;
    float mSpotFactor = 0; ///< f
};
