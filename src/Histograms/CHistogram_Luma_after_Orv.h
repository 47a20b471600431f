#pragma once

#include "Histograms/IHistogram.h"

/// Measures the means of the picture after the illumination iterations.
class CHistogram_Luma_after_Orv final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;
};
