#pragma once

#include "Histograms/IHistogram.h"

/// First measurement of the input image: white and black grey samples, band shares of the luma, means and the
/// highlight-cast flag.
class CHistogram0 final : public IHistogram {
public:
    using IHistogram::IHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;
    void complete() override;

private:
    void countGreys(std::uint32_t row, RowCounts& counts) const;
    void storeBandShares();
    void storeMeans();
};
