#pragma once

#include "Filters/Curves/LevelMath.h"
#include "Filters/IFilter.h"

#include <optional>

/// Perceptual shadows: darkens as CLevel_Dark_Left by a measured coefficient times the slider.
///
///     L = m_L_H_L_F * PerceptualDark / 1000 (neutral 0)
///     k = (sech((m - luma) / 70) - 0.32) / 0.6782 up to the mean luma m, 1 above; from position 900 on 1 and
///         above 900 (position - 900) / 200 + 1, for every luma
///
/// A final-touch run darkens by the RGB level, then each channel by its own, and takes the average with the
/// unprocessed host pixel. Gives way to the absolute shadows. The last row is left alone.
class CLevel_Dark_Left_Perceptual final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    orvela::LevelMath::Levels mainLevels() const;
    orvela::LevelMath::Levels touchLevels() const;
    float weight(double luma) const;
    void averageWithHost(int y) const;

    std::optional<orvela::LevelMath::MoveTables> mTables;
    bool mTouch = false;
};
