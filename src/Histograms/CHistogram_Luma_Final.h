#pragma once

#include "Histograms/IHistogram.h"

/// Mean luma of a finished picture, from every pixel; no channel means and no scaling.
class CHistogram_Luma_Final final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;
    void complete() override;
};
