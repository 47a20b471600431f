#pragma once

#include "Filters/IFilter.h"

#include <array>

/// Edge-aware smoothing: where the colour variation D in the 5x5 window is small compared with the window's
/// brightness M, the pixel becomes a Gaussian-weighted average; elsewhere, and in a border of three pixels,
/// it is left alone.
///
///     D / (M / 3) < OrvelaLevel3Value / 1000 * 0.3 + 0.05,   weight = exp(-d^2 / 6.25) / 0.72
///
/// The fixed divisor 20 lies slightly above the weight total 19.624, so smoothed flat areas darken by 1.9 %.
class Super_ORV final : public IFilter {
public:
    Super_ORV(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    bool isSmooth(const CARGBPlane& in, int x, int y) const;
    std::uint8_t average(const std::uint8_t* centre, int stride) const;

    static constexpr std::int32_t mRadius = 2;
    static constexpr float Gauss_denominator = 3.0F;
    std::array<float, 10> mGauss = {}; ///< weights by squared distance, entries 0 to 8
    double mThreshold = 0;
};
