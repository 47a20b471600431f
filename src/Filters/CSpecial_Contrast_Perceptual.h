#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

#include <array>

/// Corrects a colour cast: where one primary is missing from the highlights while the other two are not,
/// every pixel is tinted toward it by v and then scaled back to its mean brightness.
///
///     missing: C_H_F_High < 0.05 * C_H_F_Low,   present: C_H_F_High > 0.25 * C_H_F_Low
///     v = 0.15 / 20 * (low + 1) / (high + 1) of the missing primary, 0.15 when that quotient is above 21
///     c' = trunc(c * (1 - v) + v * target),   c'' = trunc(c' * trunc(mean before) / (mean after))
///
/// Pixels that leave the range are scaled down with their hue kept. Where no primary is missing, only the
/// truncation of the mean lowers a pixel.
class CSpecial_Contrast_Perceptual final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void findTint();

    std::array<float, 3> mTarget = {}; ///< colour to tint toward, each 0 or 255
    float mTint = 0;                   ///< v
    std::array<orvela::ChannelTable, 3> mTables = {};
};
