#pragma once

#include "Filters/TaskBase.h"

#include <algorithm>
#include <array>
#include <mutex>

/// A task that counts the samples of a plane into four 256-bin histograms and publishes them, with
/// statistics, in the parameters. The counts are exact whatever the number of threads: each row is counted
/// apart and then merged.
class IHistogram : public TaskBase {
public:
    /// The pointers are not owned and not checked.
    IHistogram(const orvela::RunContext& context, CUserParams* params, CARGBPlane* inPlane)
        : TaskBase(context, params, inPlane) {}

    /// The run of TaskBase, then StoreResults().
    bool Apply() override;

protected:
    /// What the samples of one row add to the measurement.
    struct RowCounts {
        std::array<std::uint32_t, 256> luma = {};
        std::array<std::uint32_t, 256> red = {};
        std::array<std::uint32_t, 256> green = {};
        std::array<std::uint32_t, 256> blue = {};
        std::uint32_t white = 0;
        std::uint32_t black = 0;
        std::uint32_t sumLuma = 0;
        std::uint32_t sumRed = 0;
        std::uint32_t sumGreen = 0;
        std::uint32_t sumBlue = 0;
        std::uint32_t samples = 0;

        /// Counts one pixel.
        void add(std::uint32_t r, std::uint32_t g, std::uint32_t b, std::uint32_t lumaValue);
    };

    /// Publishes the bins and the counts of bright and dark grey samples.
    virtual void StoreResults();
    /// Counts the sampled columns of a row.
    void ApplyRow(std::uint32_t row) override;

    /// Chooses step, weight and row range for a sampled measurement.
    void prepareSampling();
    /// The counts of a row's sampled columns.
    RowCounts countSampledRow(std::uint32_t row) const;
    /// Adds a row's counts to the measurement; the sums and counters wrap at 2^32.
    /// @param warnNearWrap  log a warning when a sum comes within 256 of wrapping
    void merge(const RowCounts& counts, bool warnNearWrap = false);
    /// Pixels of the plane that shares and means are taken over; 1 for an empty one, whose sums are 0.
    int pixels() const { return std::max(1, mInPlane->pixelCount()); }
    /// Weighs the bins so that they estimate counts of the whole picture.
    void scaleBins();
    /// Publishes the mean luma and the channel means, truncated.
    void storeMeans();
    /// Lists the means to the log.
    void logMeans() const;
    /// Sets the colour-cast flag when one channel mean, times `factor`, is below both others. Never clears
    /// it.
    void storeCast(float factor);

    float mHistoFactor = 1.0F;   ///< weight of one sample
    std::int32_t mHistoStep = 1; ///< distance of the samples in rows and columns
    orvela::Histogram mLuma = {};
    orvela::Histogram mRed = {};
    orvela::Histogram mBlue = {};
    orvela::Histogram mGreen = {};
    std::uint32_t mWhite = 0;
    std::uint32_t mBlack = 0;
    std::uint32_t mSumLuma = 0;
    std::uint32_t mSumLumaR = 0;
    std::uint32_t mSumLumaG = 0;
    std::uint32_t mSumLumaB = 0;
    std::uint32_t mSampleCount = 0;

private:
    std::mutex mMergeMutex;
};

namespace orvela {

/// The sum of the bins first to last, both included.
double sumOf(const Histogram& bins, std::size_t first, std::size_t last);

/// Mean bin index over the bins first to last, weighed by their counts; 0 for an empty band.
/// @tparam Count  how the counts are summed: a 32-bit integer is truncated after every addition
template <typename Count>
float bandAverage(const Histogram& bins, int first, int last) {
    float weighed = 0;
    Count count = 0;
    for (int i = first; i <= last; ++i) {
        const double bin = bins[static_cast<std::size_t>(i)];
        weighed = static_cast<float>(weighed + i * bin);
        count = static_cast<Count>(count + bin);
    }
    return count > 0 ? static_cast<float>(weighed / static_cast<double>(count)) : 0.0F;
}

/// Shares of the channels' highlights, bins 220 to 255, in the pixel count.
template <typename T>
struct HighlightShares {
    T r;
    T g;
    T b;

    static HighlightShares of(const Histogram& red, const Histogram& green, const Histogram& blue,
                              int pixels) {
        const auto share = [pixels](const Histogram& bins) {
            return static_cast<T>(static_cast<T>(sumOf(bins, 220, 255)) / static_cast<T>(pixels));
        };
        return {share(red), share(green), share(blue)};
    }

    /// 1 when one share, doubled, is below both others: the highlights lack a colour; else 0.
    float flag() const {
        return (2 * b < g && 2 * b < r) || (2 * g < r && 2 * g < b) || (2 * r < b && 2 * r < g) ? 1.0F : 0.0F;
    }
};

} // namespace orvela

/// Base of the histograms of intermediate planes.
class CLocalHistogram : public IHistogram {
public:
    using IHistogram::IHistogram;
};
