#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/IlluminationKernel.h"

#include <optional>

/// Second illumination iteration: the operation of the first (see IlluminationKernel) with its own slider,
/// OrvelaLevel2Value, its own normaliser and its own guard against pictures with too much or too little
/// detail.
class COrv_II_Iter final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void ApplyRow(std::uint32_t row) override;

private:
    void storeSharpnessSwitch();

    std::optional<orvela::IlluminationKernel> mKernel;
};
