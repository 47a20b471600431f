#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/PointFilter.h"

/// Perceptual midtones: a gamma between the measured coefficients m_M_H_L_F (low) and m_M_H_H_F (high).
///
///     position >= 500: gamma = (position - 500) / 500 * high * 9 + 1
///     position <  500: gamma = position / 500 * (1 - low) + low
///
/// A high coefficient above 1 is decreased by 1 for good before its use. A final-touch run multiplies by
/// ratios that such gammas of the means give, for all channels, then for each; a ratio r below 1 acts as the
/// factor 1 - r. Too bright pixels keep their hue. Gives way to the absolute midtones.
class CLevel_Middle_Perceptual final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    float takeMainGamma();
    void takeTouchMaps();

    orvela::WideTables mMaps = {};
};
