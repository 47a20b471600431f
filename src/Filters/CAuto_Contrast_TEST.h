#pragma once

#include "Filters/Curves/TonalStretch.h"
#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Stretches the picture between a common black limit L and white limit R; runs when the purely automatic
/// situation does not hold and automatic colour is off. Measures its input anew, on every third row and
/// column.
///
///     hazy (by luma):  each channel linearly between the luma limits, clamped
///     otherwise:       (c - L) * 255 / (R - L), the hue kept where a channel exceeds 255;
///                      pixels with a channel below L stay as they are
class CAuto_Contrast_TEST final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

    /// Stretched channel value at or above `black`; exceeds 255 above the white limit.
    /// @param factor  255 / (white - black)
    static int stretch(int value, int black, float factor);

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void readChannelLimits();

    std::int32_t C_Left_limit = 0;                  ///< by luma
    std::int32_t C_Right_limit = 255;               ///< by luma
    orvela::TonalStretch::Limits mLimits{999, 999}; ///< combined from the channels; unset in a hazy picture
    float mFactor = 1.0F;                           ///< 255 / (R - L), or 1
    bool mHazy = false;
    std::int32_t mThreshold = 0; ///< in samples
    orvela::ChannelTable mHazyCurve = {};
    orvela::WideTable mCurve = {};
};
