#pragma once

#include "Filters/IFilter.h"

#include <array>

/// Moire guard: where a darkness-biased Gaussian average of the processed 5x5 neighbourhood lies more than 15
/// levels from the unprocessed host pixel in all three channels, the host pixel is put back.
///
///     average = sum of min(centre, neighbour) * w / sum of w,   w = 1 / exp(d^2 / D)
///     D = 2 * s^4,   s = mMoire_Value * 1.5 / 1000 + 0.5
///
/// The last column and row of the picture never enter a window; a pixel without a window stays as it is.
class CMoire final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;
    bool PostApply() override;

private:
    bool differsFrom(const ConstRow& host, int x, int y) const;

    static constexpr std::int32_t mRadius = 2;
    std::array<float, 2 * mRadius* mRadius + 1> mGauss = {}; ///< by squared distance
};
