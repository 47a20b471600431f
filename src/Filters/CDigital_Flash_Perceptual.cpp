#include "Filters/CDigital_Flash_Perceptual.h"

#include "Filters/Curves/PivotCurve.h"
#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <cmath>

using namespace orvela;

namespace {

// At position 1000 the factors, 70 at most, count in full: well below the curve's bound of 101.
constexpr double FlashDivisor = 1000;

} // namespace

float FlashContrast::weight(int sum) const {
    const auto pixelMean = static_cast<float>(sum / 3.0);
    const double d = mean - pixelMean;
    if (pixelMean < mean)
        return static_cast<float>((1 / std::cosh(d / 40) - 0.85) / 0.915);
    return static_cast<float>(1 / std::cosh(d / 20));
}

int FlashContrast::apply(int c, float weight) const {
    const auto value = static_cast<float>(c);
    return PixelMath::trunc(PivotCurve::apply(value, mean, weight * (value < mean ? low : high)));
}

const TaskDescription& CDigital_Flash_Perceptual::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CDigital_Flash_Perceptual",
        .line = 87,
        .opening = "Applying CDigital_Flash_Perceptual filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CDigital_Flash_Perceptual 1st Condition matched.",
        .completion = "CDigital_Flash_Perceptual filter complete.",
    };
    return kDescription;
}

bool CDigital_Flash_Perceptual::applies() {
    return mParams->mSliderParams.DigitalFlashEnabled;
}

void CDigital_Flash_Perceptual::setUp() {
    useHostPicture();
    if (mParams->m_Histo_Light_Exception == 0) {
        const double flash = mParams->mSliderParams.mDigital_Flash_Value;
        mContrast.high = static_cast<float>(mParams->m_P_C_H_C_F_H * flash / FlashDivisor);
        mContrast.low = static_cast<float>(mParams->m_P_C_H_C_F_L * flash / FlashDivisor);
    }
    mContrast.mean = mParams->m_OriginalLuma;
    if (mContrast.low != 0 || mContrast.high != 0)
        Log::log(LogLevel::Debug, "CDigital_Flash_Perceptual 2nd Condition matched.");
    mTable.build([this](int sum) {
        return [this, weight = mContrast.weight(sum)](int c) { return mContrast.apply(c, weight); };
    });
    prepareFade();
}

void CDigital_Flash_Perceptual::prepareFade() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const double flash = sliders.mDigital_Flash_Value;
    const float boost = flash > 700 ? static_cast<float>((flash / 1000 - 0.7) / 0.3) : 0;
    const double fade = static_cast<double>(sliders.mFade_Value) / 1000;
    mFade = std::min(static_cast<float>(fade * (static_cast<double>(boost) / 5 + 1.1)), 1.0F);
    mKeep = 1 - mFade;
}

// The sum in double, stored as float: a value equal to the host's stays.
void CDigital_Flash_Perceptual::mapRow(const PixelRow& row) const {
    mTable.map(row);
    const ConstRow host = hostRow(row.y);
    const double fade = mFade;
    const double keep = mKeep;
    for (std::size_t c = 0; c < host.size(); ++c) {
        const std::uint8_t* from = host[c];
        std::uint8_t* to = row.out[c];
        for (int x = 0; x < row.width; ++x)
            to[x] = static_cast<std::uint8_t>(static_cast<float>(from[x] * fade + to[x] * keep));
    }
}
