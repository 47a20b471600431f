#pragma once

#include "Filters/Curves/TonalStretch.h"
#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Automatic colour correction: each channel is stretched softly between limits of its own, which it reads
/// off its histogram. mAuto_Color_Value / 1000 = S, 0 to 1, sets how far the limits follow the histogram and
/// how many samples, (6.67 S - 3.67) * sqrt(pixels), a bin must exceed to count.
class CAuto_Color final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

    /// Black limit for a histogram that starts at bin i: i * S, at most 120 up to S = 0.5; between 0.5 and
    /// 0.75 flattened, i / 2 * (1 + S / cosh(i / 140)).
    static float leftLimit(int i, float s);
    /// White limit for a histogram that ends at bin i: 255 - (255 - i) * S, between 0.5 and 0.75
    /// 255 - (255 - i) / 2 * (1 / cosh(i / 140) + 1) * S.
    static float rightLimit(int i, float s);
    /// New value of a channel value (0 to 255); the soft curve with a truncation between its stages.
    static std::uint8_t curve(int value, float black, float white);

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void logFlags() const;

    struct FloatLimits {
        float black = 0;
        float white = 255;
    };
    std::array<FloatLimits, 3> mLimits; ///< red, green, blue
    std::array<orvela::ChannelTable, 3> mCurves = {};
};
