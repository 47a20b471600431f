#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/IlluminationKernel.h"

#include <optional>

/// Second illumination iteration: the operation of the first (see IlluminationKernel) with its own slider,
/// OrvelaLevel2Value, its own normaliser and its own guard against pictures with too much or too little
/// detail.
class COrv_II_Iter final : public IFilter {
public:
    COrv_II_Iter(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    std::optional<orvela::IlluminationKernel> mKernel;
};
