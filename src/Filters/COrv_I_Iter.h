#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/IlluminationKernel.h"

#include <optional>

/// First illumination iteration: brightens pixels that stand out from their surround and darkens those that
/// fall behind it (see IlluminationKernel). OrvelaLevelValue sets the strength of the surround: the higher,
/// the darker flat areas come out.
class COrv_I_Iter final : public IFilter {
public:
    COrv_I_Iter(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    std::optional<orvela::IlluminationKernel> mKernel;
};
