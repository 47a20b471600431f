#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/PointFilter.h"

/// Gamma from the mean luma m of the picture (see GammaCurve): dark pictures are brightened a little, those
/// of medium brightness pulled to the middle, bright ones left alone.
///
///     gamma = 0.8 * 1.35 below 100,   0.8 * (7.5018 - 1.332 ln m) from 100 to 127,   1 above
///
/// The mean is that of pHisto_Luma after this filter has added its own samples of the picture to it; without
/// any count gamma is 1.
class Auto_Gamma final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;

private:
    void addSamplesToHistogram();
    float meanLuma() const;
    float gammaFor(float mean) const;

    static constexpr float mBaseFactor = 0.8F;
    orvela::ChannelTable mTable = {};
};
