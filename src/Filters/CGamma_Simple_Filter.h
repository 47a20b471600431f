#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/RowMapping.h"

/// Gamma by slider (see GammaCurve).
///
/// GammaCorrectionValue V: 0 gives 0.1, 500 gives 1 (neutral), 1000 gives 10, linear in between:
///
///     gamma = V * 0.9 / 500 + 0.1  below 500,   (V - 500) * 9 / 500 + 1  above
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
