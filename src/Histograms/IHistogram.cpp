#include "Histograms/IHistogram.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <cmath>
#include <utility>

using namespace orvela;

namespace {

void mergeBins(Histogram& total, const std::array<std::uint32_t, 256>& row) {
    for (std::size_t i = 0; i < total.size(); ++i)
        total[i] += row[i];
}

void scale(Histogram& bins, float factor) {
    for (double& bin : bins)
        bin = static_cast<double>(static_cast<float>(bin) * factor);
}

void warnIfNearWrap(std::uint32_t sum, std::uint32_t addition, const char* name) {
    constexpr std::uint64_t kLimit = (std::uint64_t{1} << 32) - 256;
    if (std::uint64_t{sum} + addition > kLimit)
        Log::log(LogLevel::Warning, "%s almost out of range", name);
}

} // namespace

void IHistogram::RowCounts::add(std::uint32_t r, std::uint32_t g, std::uint32_t b, std::uint32_t lumaValue) {
    ++luma[lumaValue];
    ++red[r];
    ++green[g];
    ++blue[b];
    sumLuma += lumaValue;
    sumRed += r;
    sumGreen += g;
    sumBlue += b;
    ++samples;
}

bool IHistogram::Apply() {
    if (!TaskBase::Apply())
        return false;
    guarded([this] {
        StoreResults();
        return TaskOutcome::Applied;
    });
    return outcome() == TaskOutcome::Applied;
}

void IHistogram::StoreResults() {
    mParams->WhiteCount = mWhite;
    mParams->BlackCount = mBlack;
    mParams->pHisto_Luma = mLuma;
    mParams->pHisto_Red = mRed;
    mParams->pHisto_Green = mGreen;
    mParams->pHisto_Blue = mBlue;
}

void IHistogram::ApplyRow(std::uint32_t row) {
    merge(countSampledRow(row));
}

void IHistogram::prepareSampling() {
    const int width = mInPlane->width();
    const int height = mInPlane->height();
    mHistoStep = 5;
    if (height < 700 && width < 700)
        mHistoStep = 1;
    if (height > 1000 && height > width)
        mHistoStep = height / 200;
    if (width > 1000 && width > height)
        mHistoStep = width / 200;
    mHistoFactor = static_cast<float>(mHistoStep * mHistoStep);
    Log::log(LogLevel::Debug, "Histo_Step %d", mHistoStep);
    mVertStart = 0;
    mVertStep = static_cast<std::uint32_t>(mHistoStep);
    mVertEnd = static_cast<std::uint32_t>(height - mHistoStep);
}

IHistogram::RowCounts IHistogram::countSampledRow(std::uint32_t row) const {
    RowCounts counts;
    const ConstRow in = std::as_const(*mInPlane).row(static_cast<int>(row));
    for (int x = 0; x < mInPlane->width() - mHistoStep; x += mHistoStep)
        counts.add(in[0][x], in[1][x], in[2][x], PixelMath::lumaOf(in[0][x], in[1][x], in[2][x]));
    return counts;
}

void IHistogram::merge(const RowCounts& counts, bool warnNearWrap) {
    const std::lock_guard lock(mMergeMutex);
    if (warnNearWrap) {
        warnIfNearWrap(mSumLuma, counts.sumLuma, "mSumLuma");
        warnIfNearWrap(mSumLumaR, counts.sumRed, "mSumLumaR");
        warnIfNearWrap(mSumLumaG, counts.sumGreen, "mSumLumaG");
        warnIfNearWrap(mSumLumaB, counts.sumBlue, "mSumLumaB");
    }
    mergeBins(mLuma, counts.luma);
    mergeBins(mRed, counts.red);
    mergeBins(mGreen, counts.green);
    mergeBins(mBlue, counts.blue);
    mWhite += counts.white;
    mBlack += counts.black;
    mSumLuma += counts.sumLuma;
    mSumLumaR += counts.sumRed;
    mSumLumaG += counts.sumGreen;
    mSumLumaB += counts.sumBlue;
    mSampleCount += counts.samples;
}

void IHistogram::scaleBins() {
    for (Histogram* bins : {&mLuma, &mRed, &mGreen, &mBlue})
        scale(*bins, mHistoFactor);
}

void IHistogram::storeMeans() {
    const auto mean = [this](std::uint32_t sum) {
        const double value = static_cast<double>(static_cast<float>(sum)) * mHistoFactor / pixels();
        return std::trunc(static_cast<float>(value));
    };
    mParams->m_OriginalLuma = mean(mSumLuma);
    mParams->m_OriginalLumaR = mean(mSumLumaR);
    mParams->m_OriginalLumaG = mean(mSumLumaG);
    mParams->m_OriginalLumaB = mean(mSumLumaB);
}

void IHistogram::logMeans() const {
    Log::log(LogLevel::Debug, "m_OriginalLuma %f", static_cast<double>(mParams->m_OriginalLuma));
    Log::log(LogLevel::Debug, "m_OriginalLumaR %f", static_cast<double>(mParams->m_OriginalLumaR));
    Log::log(LogLevel::Debug, "m_OriginalLumaG %f", static_cast<double>(mParams->m_OriginalLumaG));
    Log::log(LogLevel::Debug, "m_OriginalLumaB %f", static_cast<double>(mParams->m_OriginalLumaB));
}

void IHistogram::storeCast(float factor) {
    const float r = mParams->m_OriginalLumaR;
    const float g = mParams->m_OriginalLumaG;
    const float b = mParams->m_OriginalLumaB;
    const bool blueLow = factor * b < r && factor * b < g;
    const bool greenLow = factor * g < r && factor * g < b;
    const bool redLow = factor * r < g && factor * r < b;
    if (blueLow || greenLow || redLow)
        mParams->Bicromic = true;
}

namespace orvela {

double sumOf(const Histogram& bins, std::size_t first, std::size_t last) {
    double sum = 0;
    for (std::size_t i = first; i <= last; ++i)
        sum += bins[i];
    return sum;
}

} // namespace orvela
