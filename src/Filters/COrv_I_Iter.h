#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/IlluminationKernel.h"

#include <optional>

/// First illumination iteration: brightens pixels that stand out from their surround and darkens those that
/// fall behind it (see IlluminationKernel). OrvelaLevelValue sets the strength of the surround: the higher,
/// the darker flat areas come out.
class COrv_I_Iter final : public IFilter {
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
