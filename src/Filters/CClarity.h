#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/RowMapping.h"

/// Clarity: brightens each channel by its distance d from the picture's channel mean, most at a moderate
/// distance, least near white.
///
///     T(d) = exp(-|d| / (2 s^2)) * d,   s = ClarityFilterValue * 50 / 1000 + 2
///     d >= 0: c' = c + (255 - c) * T(d) / sloper,   d < 0: c' = c - (255 - c) * T(d) / 511
///
/// sloper is 511 up to position 600 and falls to 100 at 1000. Results above 255 are rescaled with their hue.
class CClarity final : public IFilter {
public:
    CClarity(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    orvela::WideTables mCurves = {};
};
