#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/MoireKernel.h"

#include <optional>

/// Moire guard: puts the unprocessed host pixel back where the processed neighbourhood has moved far from it
/// in all three channels (see MoireKernel), by mMoire_Value. Stays away where corrections that change the
/// brightness are on.
class CMoire final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;

private:
    std::optional<orvela::MoireKernel> mKernel;
};
