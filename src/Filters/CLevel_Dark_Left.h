#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/PointFilter.h"

#include <optional>

/// Absolute shadows: darkens, dark tones most.
///
///     X' = X - k * L * (1 - X / 255),   L = position * 255 / 1000 (0 to 255, neutral 0)
///     k = (sech((m - luma) / 30) - 0.028) / 0.97 up to the mean luma m, 1 above
///
/// A main run moves all channels by mAbsolute_Dark_Value; a final-touch run by mDark_Touch_Value_RGB, or by a
/// channel's own value where that is not 0. Stays away in automatic colour.
class CLevel_Dark_Left final : public orvela::PointFilter {
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
