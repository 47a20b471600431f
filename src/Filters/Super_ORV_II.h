#pragma once

#include "Filters/IFilter.h"

/// Brightening limiter: where the host's unprocessed pixel, divided by the processed one, falls below a
/// threshold in any channel, the pixel has become too bright and the host's is put back whole. The threshold
/// rises with both illumination sliders from 0.629 to 0.804.
class Super_ORV_II final : public IFilter {
public:
    Super_ORV_II(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    double mThreshold = 0;
};
