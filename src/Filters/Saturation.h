#pragma once

#include "Filters/Kernels/RowMapping.h"
#include "Filters/Kernels/SaturationKernel.h"
#include "Filters/PointFilter.h"

#include <optional>

/// Lowers or raises saturation in HSV space, or strengthens the picture's dominant colour, and then restores
/// the picture's mean brightness. By the slider position S:
///
///     S < 500          Sat' = Sat - Sat * alfa,  alfa = 1 - S / 500
///     500 <= S < 600   dominant colour, strength k = (S - 500) / 200
///     600 <= S < 601   nothing but the brightness restore
///     601 <= S         Sat' = Sat + alfa / cosh((255 - 255 Sat) / 120) / (2 - Sat)^2, at most 1,
///                      alfa = (S - 500) / 500 + 0.2
///
/// Dominant colour pulls each channel whose mean u lies below the largest mean down by
///
///     (1 / cosh((c - u) / 11)) * (tanh((max - c) / (u * 0.025)) + 1) * d * k / 2
///
/// with d the distance of the largest mean from the channel's own. A u of 0 with c at max takes tanh of 0.
class Saturation final : public orvela::PointFilter {
public:
    using orvela::PointFilter::PointFilter;

protected:
    const orvela::TaskDescription& description() const override;
    bool applies() override;
    void setUp() override;
    void mapRow(const orvela::PixelRow& row) const override;
    void complete() override;

private:
    struct Means {
        float all = 0; ///< of (R + G + B) / 3
        float r = 0;
        float g = 0;
        float b = 0;
    };

    void chooseStrength(float position);
    Means measure(const CARGBPlane& plane, int margin) const;
    Means ofWholePicture(const Means& here);
    bool restoresOriginalLuma() const;
    float lumaRatio();
    void prepareDominant(const Means& means);

    float mAlfa = 1; ///< saturation factor
    orvela::SaturationKernel::Change mChange = orvela::SaturationKernel::Change::Raise;
    bool mDominant = false;                       ///< dominant-colour mode
    float mStrength = 0;                          ///< k
    float mMeanIn = 0;                            ///< brightness to restore
    bool mKnowsWhole = true;                      ///< the means are those of the whole picture
    float mWholeShare = 1;                        ///< mean of the whole picture / mean of the plane
    std::int32_t mStep = 5;                       ///< distance of the samples in rows and columns
    orvela::WideTables mCurves = {};              ///< dominant-colour mode
    std::optional<orvela::SaturationKernel> mHsv; ///< otherwise
};
