#pragma once

#include "Histograms/IHistogram.h"

/// Measures an intermediate image before the digital flash: means, and whether the highlights lack a colour.
class CHistogram_VIII final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;
};
