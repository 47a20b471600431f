#pragma once

#include "Filters/Kernels/SumValueTable.h"
#include "Filters/PointFilter.h"

namespace orvela {

/// The light of CDigital_Flash_Perceptual: each value moves away from the mean of the picture (see
/// PivotCurve), by a share that falls with the distance d = mean - (R + G + B) / 3:
///
///     weight = (1 / cosh(d / 40) - 0.85) / 0.915  for pixels darker than the mean,   1 / cosh(d / 20) others
///     k = weight * (low below the mean, high from the mean)
///
/// Far below the mean the weight is negative: the darkest pixels are pulled in.
struct FlashContrast {
    float low = 0;  ///< contrast below the mean, up to 70
    float high = 0; ///< contrast from the mean on, up to 70
    float mean = 0; ///< mean luma of the picture, a whole number

    /// @param sum  R + G + B of the pixel
    float weight(int sum) const;
    /// @param c       channel value, 0 to 255
    /// @param weight  of its pixel
    int apply(int c, float weight) const;
};

} // namespace orvela

/// Lights up the picture by mDigital_Flash_Value (0 is neutral) times the factors of the analysis, then fades
/// it toward the unprocessed picture by mFade_Value, the more so the stronger the flash. No light where the
/// highlights have a cast.
///
///     fade = mFade_Value / 1000 * (a / 5 + 1.1), at most 1
///     a = (mDigital_Flash_Value / 1000 - 0.7) / 0.3 above 700, 0 up to it
class CDigital_Flash_Perceptual final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void prepareFade();

    orvela::FlashContrast mContrast;
    orvela::SumValueTable mTable;
    float mFade = 0; ///< share of the unprocessed picture, 0 to 1
    float mKeep = 1; ///< share of the lit picture
};
