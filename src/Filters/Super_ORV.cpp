#include "Filters/Super_ORV.h"

#include "Utility/Logger.h"

#include <cmath>
#include <utility>

Super_ORV::Super_ORV(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : IFilter(params, inPlane, outPlane) {
    mName = "Super_ORV";
}

bool Super_ORV::PreApply() {
    Log::log(LogLevel::Debug, "Applying Super_ORV filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    const bool tooSmall = mInPlane->height() - 2 <= 2 || mInPlane->width() - 2 <= 2;
    if (!mParams->mSliderParams.OrvelaLevel3Enabled || tooSmall)
        return false;
    Log::log(LogLevel::Debug, "Gauss_denominator%f", static_cast<double>(Gauss_denominator));
    for (std::size_t i = 0; i <= 2 * mRadius * mRadius; ++i)
        mGauss[i] = static_cast<float>(1 / (std::exp(static_cast<double>(i) / 6.25) * 0.72));
    const float level = mParams->mSliderParams.OrvelaLevel3Value / 1000;
    mThreshold = level * 0.3 + 0.05F;
    mVertStart = mRadius + 1;
    mVertEnd = static_cast<std::uint32_t>(mInPlane->height() - mRadius - 1);
    return true;
}

void Super_ORV::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/Super_ORV", 74);
    const CARGBPlane& in = *mInPlane;
    const int y = static_cast<int>(row);
    const int width = in.width();
    const ConstRow here = in.row(y);
    const Row out = mOutPlane->row(y);
    for (int x = mRadius + 1; x < width - mRadius - 1; ++x) {
        if (!isSmooth(in, x, y))
            continue;
        for (std::size_t c = 0; c < 3; ++c)
            out[c][x] = average(here[c] + x, width);
    }
}

// A ratio that is undefined (a black window) is not smooth.
bool Super_ORV::isSmooth(const CARGBPlane& in, int x, int y) const {
    const ConstRow centre = in.row(y);
    const int r0 = centre[0][x];
    const int g0 = centre[1][x];
    const int b0 = centre[2][x];
    int brightness = 0;
    float variation = 0;
    for (int wy = y - mRadius; wy <= y + mRadius; ++wy) {
        const ConstRow window = in.row(wy);
        for (int wx = x - mRadius; wx <= x + mRadius; ++wx) {
            const int r = window[0][wx];
            const int g = window[1][wx];
            const int b = window[2][wx];
            brightness += r + g + b;
            const int square = (r0 - r) * (r0 - r) + (g0 - g) * (g0 - g) + (b0 - b) * (b0 - b);
            variation += std::sqrt(static_cast<float>(square));
        }
    }
    const float ratio = variation / (static_cast<float>(brightness) / Gauss_denominator);
    return ratio < mThreshold;
}

// Integer sums of each class of equal distance, times the class weight, added in order of the class.
std::uint8_t Super_ORV::average(const std::uint8_t* p, int stride) const {
    const int up = -stride;
    const int down = stride;
    const int up2 = 2 * up;
    const int down2 = 2 * down;
    const int d1 = p[-1] + p[1] + p[up] + p[down];
    const int d2 = p[up - 1] + p[up + 1] + p[down - 1] + p[down + 1];
    const int d4 = p[-2] + p[2] + p[up2] + p[down2];
    const int d5 = p[up - 2] + p[up + 2] + p[down - 2] + p[down + 2] + p[up2 - 1] + p[up2 + 1] +
                   p[down2 - 1] + p[down2 + 1];
    const int d8 = p[up2 - 2] + p[up2 + 2] + p[down2 - 2] + p[down2 + 2];
    float sum = mGauss[0] * static_cast<float>(p[0]);
    sum += mGauss[1] * static_cast<float>(d1);
    sum += mGauss[2] * static_cast<float>(d2);
    sum += mGauss[4] * static_cast<float>(d4);
    sum += mGauss[5] * static_cast<float>(d5);
    sum += mGauss[8] * static_cast<float>(d8);
    return static_cast<std::uint8_t>(sum / 20);
}

bool Super_ORV::PostApply() {
    Log::log(LogLevel::Debug, "Blur Filter complete.");
    return true;
}
