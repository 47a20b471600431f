#include "Filters/CDigital_Flash_Perceptual.h"

#include "Filters/Curves/PivotCurve.h"
#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <cmath>
#include <utility>

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

bool CDigital_Flash_Perceptual::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    if (!sliders.DigitalFlashEnabled)
        return false;
    Log::log(LogLevel::Debug,
             "Applying CDigital_Flash_Perceptual filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "CDigital_Flash_Perceptual 1st Condition matched.");
    if (mParams->m_Histo_Light_Exception == 0) {
        const double flash = sliders.mDigital_Flash_Value;
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
    return true;
}

void CDigital_Flash_Perceptual::prepareFade() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const double flash = sliders.mDigital_Flash_Value;
    const float boost = flash > 700 ? static_cast<float>((flash / 1000 - 0.7) / 0.3) : 0;
    const double fade = static_cast<double>(sliders.mFade_Value) / 1000;
    mFade = std::min(static_cast<float>(fade * (static_cast<double>(boost) / 5 + 1.1)), 1.0F);
    mKeep = 1 - mFade;
}

void CDigital_Flash_Perceptual::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CDigital_Flash_Perceptual", 87);
    const int y = static_cast<int>(row);
    const Row out = mOutPlane->row(y);
    mTable.mapRow(std::as_const(*mInPlane).row(y), out, mInPlane->width());
    fadeRow(hostRow(y), out);
}

// The sum in double, stored as float: a value equal to the host's stays.
void CDigital_Flash_Perceptual::fadeRow(ConstRow host, Row out) const {
    const double fade = mFade;
    const double keep = mKeep;
    const int width = mInPlane->width();
    for (std::size_t channel = 0; channel < out.size(); ++channel) {
        const std::uint8_t* from = host[channel];
        std::uint8_t* to = out[channel];
        for (int x = 0; x < width; ++x)
            to[x] = static_cast<std::uint8_t>(static_cast<float>(from[x] * fade + to[x] * keep));
    }
}

bool CDigital_Flash_Perceptual::PostApply() {
    Log::log(LogLevel::Debug, "CDigital_Flash_Perceptual filter complete.");
    return true;
}
