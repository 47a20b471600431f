#pragma once

#include "Histograms/IHistogram.h"

/// Measures an intermediate image before the automatic colour correction: means, band averages, and a very
/// strong colour cast (a channel mean below a quarter of both others).
class CHistogram_IV final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void complete() override;
    void StoreResults() override;

private:
    void logFlags() const;
};
