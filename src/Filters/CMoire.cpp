#include "Filters/CMoire.h"

#include "Filters/PixelMath.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace {

constexpr int kTolerance = 15; // levels

} // namespace

bool CMoire::PreApply() {
    Log::log(LogLevel::Debug, "Applying CMoire filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool otherCorrections = sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled ||
                                  sliders.ContrastEnabled || sliders.BrightnessEnabled;
    if (!sliders.Moire_Enabled || otherCorrections || mParams->Switch_TOO_SHARP ||
        mParams->Under_Exposed_Picture)
        return false;
    Log::log(LogLevel::Debug, "CMoire Condition matched.");
    const auto sigma = static_cast<float>(static_cast<double>(sliders.mMoire_Value) * 1.5 / 1000 + 0.5);
    const float variance = sigma * sigma;
    const float denominator = 2 * (variance * variance);
    for (std::size_t i = 0; i < mGauss.size(); ++i)
        mGauss[i] = static_cast<float>(1 / std::exp(static_cast<double>(i) / denominator));
    return true;
}

void CMoire::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CMoire", 52);
    const int y = static_cast<int>(row);
    const ConstRow here = std::as_const(*mInPlane).row(y);
    const ConstRow host = hostRow(y);
    const Row out = mOutPlane->row(y);
    for (int x = 0; x < mInPlane->width(); ++x) {
        const ConstRow& source = differsFrom(host, x, y) ? host : here;
        for (std::size_t c = 0; c < 3; ++c)
            out[c][x] = source[c][x];
    }
}

// The first channel that is near the host's decides.
bool CMoire::differsFrom(const ConstRow& host, int x, int y) const {
    const int left = std::max(x - mRadius, 0);
    const int right = std::min(x + mRadius, mInPlane->width() - 2);
    const int top = std::max(y - mRadius, 0);
    const int bottom = std::min(y + mRadius, mInPlane->height() - 2);
    if (right < left || bottom < top)
        return false;
    for (const Channel channel : kChannels) {
        const auto c = static_cast<std::size_t>(channel);
        const std::uint8_t centre = std::as_const(*mInPlane).row(y)[c][x];
        double sum = 0;
        double weightSum = 0;
        for (int wy = top; wy <= bottom; ++wy) {
            const std::uint8_t* window = std::as_const(*mInPlane).row(wy)[c];
            for (int wx = left; wx <= right; ++wx) {
                const double weight =
                    mGauss[static_cast<std::size_t>((wx - x) * (wx - x) + (wy - y) * (wy - y))];
                sum += std::min(centre, window[wx]) * weight;
                weightSum += weight;
            }
        }
        const auto average = static_cast<float>(sum / weightSum);
        if (std::abs(PixelMath::trunc(average - static_cast<float>(host[c][x]))) <= kTolerance)
            return false;
    }
    return true;
}

bool CMoire::PostApply() {
    Log::log(LogLevel::Debug, "CMoire Filter complete.");
    return true;
}
