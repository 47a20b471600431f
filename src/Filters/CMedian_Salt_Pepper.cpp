#include "Filters/CMedian_Salt_Pepper.h"

#include "Filters/Kernels/PixelMath.h"
#include "Filters/Kernels/ScaledTile.h"

#include <algorithm>
#include <utility>

using namespace orvela;

namespace {

constexpr int kDarkestSpot = 101;

int brightness(const ConstRow& row, int x) {
    return (row[0][x] + row[1][x] + row[2][x]) / 3;
}

int thirdSmallest(int a, int b, int c, int d) {
    return std::max(std::min(std::max(a, b), std::max(c, d)), std::max(std::min(a, b), std::min(c, d)));
}

} // namespace

const TaskDescription& CMedian_Salt_Pepper::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CMedian_Salt_Pepper",
        .line = 52,
        .dumpName = "CMedian_Salt_Pepper",
        .opening = "Applying CMedian_Salt_Pepper filter from plane at 0x%x to plane at 0x%x...",
        .completion = "CMedian_Salt_Pepper Filter complete.",
        .writes = Writes::SomePixels,
    };
    return kDescription;
}

bool CMedian_Salt_Pepper::applies() {
    return mParams->mSliderParams.SaltPepperEnabled && !mParams->Switch_TOO_SHARP;
}

void CMedian_Salt_Pepper::setUp() {
    const double factor = 2 - static_cast<double>(mParams->mSliderParams.SaltPepperValue) * 1.9 / 1000;
    mSpotFactor = mParams->Dark_middle ? 0.5F : static_cast<float>(factor);
    mVertStart = mRadius;
    mVertEnd = static_cast<std::uint32_t>(mInPlane->height() - mRadius);
}

void CMedian_Salt_Pepper::ApplyRow(std::uint32_t row) {
    const int y = static_cast<int>(row);
    const ConstRow above = std::as_const(*mInPlane).row(y - mRadius);
    const ConstRow here = std::as_const(*mInPlane).row(y);
    const Row out = mOutPlane->row(y);
    recolourRow(out, mRadius, mInPlane->width() - mRadius, [&](ScaledTile& tile, int i, int x) {
        const int upperLeft = brightness(above, x - 1);
        const int upper = brightness(above, x);
        const int left = brightness(here, x - 1);
        const int centre = brightness(here, x);
        const float mean = static_cast<float>(upperLeft + upper + left + centre) / 4;
        const bool isSpot = centre >= kDarkestSpot && centre > PixelMath::trunc(mean * mSpotFactor);
        const int median = thirdSmallest(upperLeft, upper, left, centre);
        const PixelMath::Rgb c = {here[0][x], here[1][x], here[2][x]};
        tile.set(i, c, isSpot ? static_cast<float>(median * 3) / static_cast<float>(c.r + c.g + c.b) : 1.0F);
    });
}
