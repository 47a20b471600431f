#pragma once

#include "Filters/Kernels/SumValueTable.h"
#include "Filters/PointFilter.h"

namespace orvela {

/// What CContrast_Brightness_Perceptual does to a pixel: adds the brightness, then moves each value away from
/// the mean of the picture (see PivotCurve), by the less the further the pixel's own mean lies from it:
///
///     k = weight * (low up to the mean, high above),   weight = 1 / cosh((mean - (R + G + B) / 3) / 100)
struct PerceptualContrast {
    float brightness = 0; ///< -255 to 255
    float high = 0;       ///< contrast above the mean, up to 60
    float low = 0;        ///< contrast up to the mean, up to 60
    float mean = 0;       ///< mean luma of the picture, a whole number

    /// @param sum  R + G + B of the pixel
    float weight(int sum) const;
    /// @param c       channel value, 0 to 255
    /// @param weight  of its pixel
    int apply(int c, float weight) const;
};

} // namespace orvela

/// Contrast and brightness by the factors that the analysis found fit for the picture. Contrast position 0 is
/// neutral (1000 is the full factor), brightness position 500.
///
/// A main run takes Contrast2Value and Brightness2Value and raises no contrast on a side that already clips;
/// a final-touch run takes the perceptual touch sliders. Leaves the picture alone when the plain sliders are
/// on or it is under-exposed; skipped with automatic contrast.
class CContrast_Brightness_Perceptual final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    bool prepareMain();
    bool prepareTouch();
    void takeContrast(float position);
    void takeBrightness(float position);
    void logTouch() const;

    orvela::PerceptualContrast mContrast;
    orvela::SumValueTable mTable;
    bool mActive = false; ///< otherwise the row pass changes nothing
};
