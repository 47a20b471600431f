#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/PointFilter.h"

#include <optional>

/// Absolute highlights: brightens, light tones most.
///
///     X' = X + k * L * X / 255,   L = position * 255 / 1000 (0 to 255)
///     k = (sech((m - luma) / 120) - 0.32) / 0.6782 for every luma, m the mean
///
/// A main run moves all channels by mAbsolute_Light_Value, whose position 0 stands for L = 255; a final-touch
/// run by mLight_Touch_Value_RGB, or by a channel's own value where that is not 0, and not at all when all
/// four are 0. Stays away in automatic colour.
class CLevel_Light_Right final : public orvela::PointFilter {
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

    std::optional<orvela::LevelMath::MoveTables> mTables;
};
