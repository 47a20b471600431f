#pragma once

#include "Histograms/IHistogram.h"

/// Measures the means of the picture after the illumination iterations.
class CHistogram_Luma_after_Orv final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void complete() override;
};
