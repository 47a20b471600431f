#pragma once

#include "Filters/Curves/TonalStretch.h"
#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// The contrast step of the automatic-contrast mode: one black limit L and one white limit R, combined from
/// the channel histograms, stretch all three channels. A hazy picture (R < 215 and L > 40) is stretched hard,
/// any other one softly, so that 0 and 255 stay where they are:
///
///     hazy:    255 * (c - L) / (R - L)
///     normal:  c1 = c - (1 - c / 255) * L,  c1 + c1 / 255 * (255 - R)
///
/// Stays away from pictures with a colour cast (it sets Bicromic) and from under-exposed ones, and gives way
/// to manual contrast and brightness.
class Auto_Contrast final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

    /// New value of a channel value (0 to 255) in a hazy picture; with equal limits 255.
    static std::uint8_t hazyCurve(int value, orvela::TonalStretch::Limits limits);
    /// New value of a channel value (0 to 255) in any other picture.
    static std::uint8_t normalCurve(int value, orvela::TonalStretch::Limits limits);

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void scanChannels(double threshold);
    int chooseThreshold() const;

    std::array<orvela::TonalStretch::Limits, 3> mChannels; ///< red, green, blue
    orvela::TonalStretch::Limits mLimits;                  ///< combined
    orvela::ChannelTable mCurve = {};
};
