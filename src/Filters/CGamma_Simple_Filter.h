#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Gamma by slider (see GammaCurve).
///
/// GammaCorrectionValue V: 0 gives 0.1, 500 gives 1 (neutral), 1000 gives 10, linear in between:
///
///     gamma = V * 0.9 / 500 + 0.1  below 500,   (V - 500) * 9 / 500 + 1  above
class CGamma_Simple_Filter final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void prepare() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    orvela::ChannelTable mTable = {};
};
