#pragma once

#include "Filters/PointFilter.h"

/// Brightening limiter: where the host's unprocessed pixel, divided by the processed one, falls below a
/// threshold in any channel, the pixel has become too bright and the host's is put back whole. The threshold
/// rises with both illumination sliders from 0.629 to 0.804.
class Super_ORV_II final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    double mThreshold = 0;
};
