#pragma once

#include "Histograms/IHistogram.h"

/// Measures an intermediate image: means, and a colour cast or a balance of the channel means.
class CHistogram_VII final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    const orvela::TaskDescription& description() const override;
    void setUp() override;
    void complete() override;
    void StoreResults() override;

private:
    void storeBalance();
};
