#pragma once

#include "Histograms/IHistogram.h"

/// Measures an intermediate image: means, the average luma of the dark, middle and light bands, and a strong
/// colour cast (a channel mean below half of both others).
class CHistogram_III final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    void setUp() override;
    void complete() override;
};
