#pragma once

#include "Histograms/IHistogram.h"

/// Measures an intermediate image: means, and a colour cast or a balance of the channel means.
class CHistogram_VII final : public CLocalHistogram {
public:
    using CLocalHistogram::CLocalHistogram;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;
    void StoreResults() override;

private:
    void testBalance() const;
};
