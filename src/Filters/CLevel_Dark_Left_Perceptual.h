#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/PointFilter.h"

#include <optional>

/// Perceptual shadows: darkens as CLevel_Dark_Left by a measured coefficient times the slider.
///
///     L = m_L_H_L_F * PerceptualDark / 1000 (neutral 0)
///     k = (sech((m - luma) / 70) - 0.32) / 0.6782 up to the mean luma m, 1 above; from position 900 on 1 and
///         above 900 (position - 900) / 200 + 1, for every luma
///
/// A final-touch run darkens by the RGB level, then each channel by its own, and takes the average with the
/// unprocessed host pixel. Gives way to the absolute shadows. The last row is left alone.
class CLevel_Dark_Left_Perceptual final : public orvela::PointFilter {
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
    void averageWithHost(const orvela::PixelRow& row) const;

    std::optional<orvela::LevelMath::MoveTables> mTables;
    bool mTouch = false;
};
