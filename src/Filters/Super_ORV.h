#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/SmoothingKernel.h"

#include <optional>

/// Edge-aware smoothing (see SmoothingKernel) with the threshold OrvelaLevel3Value / 1000 * 0.3 + 0.05. A
/// border of three pixels is left alone. The kernel's divisor 20 lies slightly above the weight total 19.624,
/// so smoothed flat areas darken by 1.9 %.
class Super_ORV final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;

private:
    static constexpr std::int32_t mRadius = orvela::SmoothingKernel::kRadius;
    std::optional<orvela::SmoothingKernel> mKernel;
};
