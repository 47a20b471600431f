#include "Filters/CBilinear.h"

#include "Filters/Kernels/BilateralKernel.h"
#include "Filters/Kernels/PixelMath.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"
#include "Utility/RowScheduler.h"

#include <cmath>
#include <new>

using namespace orvela;

namespace {

constexpr char kSource[] = "Filters/CBilinear";
constexpr std::size_t kDistances = 4; // of which 0, 1 and 2 occur
constexpr std::size_t kRanges = 3 * 255 * 255 + 1;
constexpr double kRangeScale = 0.05;
constexpr float kLargeSide = 700; // square root of the pixel count

float sideOf(std::int32_t pixels) {
    return static_cast<float>(std::sqrt(static_cast<double>(pixels)));
}

// Null when there is no memory.
std::unique_ptr<float[]> allocate(std::size_t count) {
    return std::unique_ptr<float[]>(new (std::nothrow) float[count]);
}

} // namespace

const TaskDescription& CBilinear::description() const {
    static constexpr TaskDescription kDescription = {
        .source = kSource,
        .line = 124,
        .dumpName = "CBilinear",
        .start = "Applying CBilinear filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CBilinear Condition matched.",
        .completion = "Bilinear Noise Filter complete.",
        .writes = Writes::SomePixels,
    };
    return kDescription;
}

bool CBilinear::applies() {
    const float side = sideOf(picturePixels());
    Log::log(LogLevel::Debug, "Size_Factor: %f", static_cast<double>(side));
    Log::log(LogLevel::Debug, "Bilinear_Filtering_Enabled && Normal_Picture");
    // The flag as it was on entry counts for the large pictures, the new one for all.
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool big = (sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled) && side > kLargeSide &&
                     !mParams->Switch_TOO_SHARP;
    storeSharpnessSwitch();
    return (sliders.BilinearFilteringEnabled || big) && !mParams->Switch_TOO_SHARP && mParams->Normal_Picture;
}

void CBilinear::storeSharpnessSwitch() {
    mParams->Switch_TOO_SHARP = mParams->Switch_TOO_SHARP_ORV_I && mParams->Switch_TOO_SHARP_ORV_II &&
                                mParams->mSliderParams.OrvelaLevel3Enabled;
    Log::log(LogLevel::Debug, "Switch_TOO_SHARP: %d", mParams->Switch_TOO_SHARP);
}

void CBilinear::setUp() {
    const double position = mParams->mSliderParams.BilinearFilteringValue;
    const auto value = static_cast<float>(sideOf(picturePixels()) > kLargeSide ? position * 0.6 : position);
    const float sigma = value * 4.5F / 1000 + 0.5F;
    prepareTables(sigma * sigma);
    mVertStart = 1;
    mVertEnd = static_cast<std::uint32_t>(mInPlane->height() - 1);
}

void CBilinear::prepareTables(float spatialVariance) {
    m_cBilinear = allocate(kDistances);
    if (!m_cBilinear) {
        Log::log(LogLevel::Error, "Bilinear filter was unable to declare the %d floats array (m_cBilinear).",
                 static_cast<int>(kDistances));
        throw COutOfMemoryEx(
            QStringLiteral("Bilinear filter was unable to declare the m_cBilinear floats array."), kSource,
            93);
    }
    m_sBilinear = allocate(kRanges);
    if (!m_sBilinear) {
        m_cBilinear.reset();
        Log::log(LogLevel::Error, "Bilinear filter was unable to declare the %d floats array (m_sBilinear).",
                 static_cast<int>(kRanges));
        throw COutOfMemoryEx(
            QStringLiteral("Bilinear filter was unable to declare the m_sBilinear floats array."), kSource,
            107);
    }
    for (std::size_t i = 0; i < kDistances; ++i)
        m_cBilinear[i] = static_cast<float>(std::exp(-static_cast<double>(i) / spatialVariance));
    const double rangeVariance = PixelMath::trunc(22500 * kRangeScale);
    orvela::forEachRange(0, kRanges, 1U << 14, [this, rangeVariance](unsigned first, unsigned last) {
        for (unsigned i = first; i < last; ++i)
            m_sBilinear[i] = static_cast<float>(std::exp(-static_cast<double>(i) / rangeVariance));
    });
}

void CBilinear::ApplyRow(std::uint32_t row) {
    BilateralKernel(m_cBilinear.get(), m_sBilinear.get())
        .applyRow(*mInPlane, *mOutPlane, static_cast<int>(row));
}
