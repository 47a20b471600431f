#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/RowMapping.h"

/// Gamma by slider (see GammaCurve).
///
/// GammaCorrectionValue gives it (see SliderScales::gammaAt); 500 is neutral.
class CGamma_Simple_Filter final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    orvela::ChannelTable mTable = {};
};
