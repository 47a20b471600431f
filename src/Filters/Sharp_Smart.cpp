#include "Filters/Sharp_Smart.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

// Distances of the pixel to its neighbours inside the picture, each as a share of the picture.
double detailAt(const CARGBPlane& in, int x, int y) {
    const auto pixels = static_cast<float>(in.pixelCount());
    const ConstRow centre = in.row(y);
    double sum = 0;
    for (int wy = std::max(y - 1, 0); wy <= std::min(y + 1, in.height() - 1); ++wy) {
        const ConstRow window = in.row(wy);
        for (int wx = std::max(x - 1, 0); wx <= std::min(x + 1, in.width() - 1); ++wx) {
            int square = 0;
            for (std::size_t c = 0; c < 3; ++c) {
                const int difference = centre[c][x] - window[c][wx];
                square += difference * difference;
            }
            sum += static_cast<double>(std::sqrt(static_cast<float>(square)) / pixels);
        }
    }
    return sum;
}

} // namespace

const TaskDescription& Sharp_Smart::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/Sharp_Smart",
        .line = 64,
        .dumpName = "Sharp_Smart",
        .start = "Applying Sharp_Smart filter from plane at 0x%x to plane at 0x%x...",
        .completion = "Sharp_Smart Noise Filter complete.",
        .writes = Writes::Nothing,
    };
    return kDescription;
}

void Sharp_Smart::setUp() {
    const int width = mInPlane->width();
    const int height = mInPlane->height();
    Log::log(LogLevel::Debug, "Size_Factor: %f", std::sqrt(static_cast<double>(mInPlane->pixelCount())));
    mParams->mSum_Color = 0;
    mStep = width < 700 && height < 700 ? 1 : PixelMath::samplingStep(width, height);
    Log::log(LogLevel::Debug, "Histo_Step %d", mStep);
    mVertStart = 0;
    mVertEnd = static_cast<std::uint32_t>(height - mStep);
    mVertStep = static_cast<std::uint32_t>(mStep);
    mRowSums.assign(static_cast<std::size_t>(std::max(0, (height - mStep) / mStep)), 0.0);
}

void Sharp_Smart::ApplyRow(std::uint32_t row) {
    double sum = 0;
    for (int x = 0; x < mInPlane->width() - mStep; x += mStep)
        sum += detailAt(*mInPlane, x, static_cast<int>(row));
    mRowSums[row / mVertStep] = sum;
}

void Sharp_Smart::complete() {
    for (const double sum : mRowSums)
        mParams->mSum_Color += sum;
    Log::log(LogLevel::Debug, "mSum_Color %f", mParams->mSum_Color);
}
