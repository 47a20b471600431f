#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/RowMapping.h"

/// Gamma within the range that the analysis of the midtones found fit for the picture (see GammaCurve).
///
/// PerceptualGamma V, with 500 neutral:
///
///     gamma = (1 - m_M_H_L_F) * V / 500 + m_M_H_L_F  below 500,   (V - 500) / 500 * m_M_H_H_F + 1  from 500
///
/// From 500 on a factor m_M_H_H_F above 1 is first lowered by 1, for every later reader too. Stays neutral
/// while the plain gamma slider is on.
class CGamma_Perceptual final : public IFilter {
public:
    CGamma_Perceptual(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    float perceptualGamma() const;

    orvela::ChannelTable mTable = {};
};
