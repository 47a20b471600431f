#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/PointFilter.h"

#include <optional>

/// Perceptual highlights: brightens as CLevel_Light_Right by a measured coefficient times the slider.
///
///     L = m_R_L_L_F * PerceptualLight / 1000 (neutral 0)
///     k = (sech((m - luma) / 70) - 0.32) / 0.6782 from the mean luma m on, 1 below; from position 900 on 1
///         and above 900 (position - 900) / 200 + 1, for every luma
///
/// A final-touch run, with k of width 120 for every luma, brightens by the RGB level, then each channel by
/// its own. Gives way to the absolute levels.
class CLevel_Light_Right_Perceptual final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    orvela::LevelMath::Levels mainLevels() const;
    orvela::LevelMath::Levels touchLevels() const;
    float weight(double luma) const;

    std::optional<orvela::LevelMath::MoveTables> mTables;
    bool mTouch = false;
};
