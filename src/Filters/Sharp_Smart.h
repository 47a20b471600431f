#pragma once

#include "Filters/IFilter.h"

#include <vector>

/// Measures how much colour detail the picture has: mSum_Color, the sum over sampled pixels of the colour
/// distances to their 3x3 neighbours, divided by the pixel count. Writes no pixel. The sum is the same for
/// every number of threads.
class Sharp_Smart final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    const orvela::TaskDescription& description() const override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;
    void complete() override;

private:
    std::int32_t mStep = 1;       ///< distance of the samples in rows and columns
    std::vector<double> mRowSums; ///< by sampled row: added in this order, whatever row ends first
};
