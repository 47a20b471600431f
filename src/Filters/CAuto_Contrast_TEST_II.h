#pragma once

#include "Filters/Curves/TonalStretch.h"
#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// The stretch of the automatic modes, by limits that go only half way: from 0 to the first and from 255 to
/// the last bin of each channel that counts. Measures its input anew, on every pixel.
///
///     hazy (by luma):  each channel linearly between the luma limits, clamped
///     otherwise:       (c - L) * 255 / (R - L) from L on, c * 255 / R below it, with the channel's own
///                      limits; the hue is kept where a channel exceeds 255
class CAuto_Contrast_TEST_II final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

    /// New value of a channel value (0 to 255) between the channel's limits; exceeds 255 above the white one.
    /// @param factor  255 / (white - black), or 1
    static int stretch(int value, orvela::TonalStretch::Limits limits, float factor);

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void storeHistograms();
    void readChannelLimits();
    void prepareCurves();

    std::int32_t C_Left_limit = 0;    ///< by luma
    std::int32_t C_Right_limit = 255; ///< by luma
    std::int32_t Left_Limit_R = 0;
    std::int32_t Right_Limit_R = 255;
    std::int32_t Left_Limit_G = 0;
    std::int32_t Right_Limit_G = 255;
    std::int32_t Left_Limit_B = 0;
    std::int32_t Right_Limit_B = 255;
    float HighLight_Radio_R = 1.0F;
    float HighLight_Radio_G = 1.0F;
    float HighLight_Radio_B = 1.0F;
    bool mHazy = false;
    float mThreshold = 0; ///< in samples
    orvela::ChannelTable mHazyCurve = {};
    orvela::WideTables mCurves = {};
};
