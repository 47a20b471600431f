#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Gamma within the range that the analysis of the midtones found fit for the picture (see GammaCurve).
///
/// PerceptualGamma V, with 500 neutral:
///
///     gamma = (1 - m_M_H_L_F) * V / 500 + m_M_H_L_F  below 500,   (V - 500) / 500 * m_M_H_H_F + 1  from 500
///
/// From 500 on a factor m_M_H_H_F above 1 is first lowered by 1, for every later reader too. Stays neutral
/// while the plain gamma slider is on.
class CGamma_Perceptual final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    float takeGamma();

    orvela::ChannelTable mTable = {};
};
