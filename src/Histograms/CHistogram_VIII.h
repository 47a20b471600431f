#pragma once

#include "Histograms/IHistogram.h"

/// Measures an intermediate image before the digital flash: means, and whether the highlights lack a colour.
class CHistogram_VIII final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void complete() override;
};
