#pragma once

#include "Filters/Curves/TonalStretch.h"
#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Brings the channel means back to what they were before the illumination iterations, keeping the hue where
/// a channel saturates, and fades the result toward the unprocessed picture:
///
///     balanced = c * (mean before / mean after)
///     result   = host * Fade_Value_factor + balanced * Fade_Inverse
///
/// mFade_Value (0 to 1000), the iterations' levels and the picture's size set the fade. Bright pictures whose
/// means all fell get gains that are normalised to an average brightness instead.
class CAuto_Contrast_I final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

    /// Share of the fade that a picture of so many pixels gets: 0.5 for large, near 1 for small ones.
    static float sharpnessFactor(std::int32_t pixelCount);

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void storeSharpnessSwitch();
    void prepareRatios();
    void normaliseRatios(float f);
    void logRatios() const;
    void prepareFade();
    int fade(int processed, int host) const;
    void logOverflows(const orvela::PixelRow& balanced, const orvela::ConstRow& host) const;

    float RatioR = 1.0F;
    float RatioG = 1.0F;
    float RatioB = 1.0F;
    float Fade_Inverse = 1.0F;      ///< share of the balanced pixel
    float Fade_Value_factor = 0.0F; ///< share of the host's pixel
    orvela::WideTables mGains = {};
};
