#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Gamma by slider (see GammaCurve).
///
/// GammaCorrectionValue gives it (see SliderScales::gammaAt); 500 is neutral.
class CGamma_Simple_Filter final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    orvela::ChannelTable mTable = {};
};
