#include "SmartAnalyzers/CSmartAnalyzer_Digital_Flash.h"

#include "SmartAnalyzers/ToneMass.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

using namespace ToneMass;

namespace {

constexpr double kHighlights = 225;
constexpr double kShadows = 30;
constexpr double kSlope = 30;
constexpr float kMostLimit = 70;

// A limit above the most that the flash bears gives way to the fixed one.
float limitOr(double limit, float fixed) {
    const float whole = std::floor(static_cast<float>(limit));
    return whole <= kMostLimit ? whole : fixed;
}

// The bins are numbered from 1 here; the distance from the mean grows by 50 / 51.
double spread(int bin, double mean) {
    const double x = bin + 1;
    if (x < mean + 1)
        return std::max(0.0, x - (mean - x) * 50 / 51);
    return std::min(255.0, x + (x - mean) * 50 / 51);
}

} // namespace

void CSmartAnalyzer_Digital_Flash::Analyze() {
    CUserParams& params = *mParams;
    if (!params.mSliderParams.DigitalFlashEnabled)
        return;
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Digital_Flash is starting.");
    const double mean = params.m_OriginalLuma;
    const Histogram luma = remap(params.pHisto_Luma, tabulate([mean](int i) { return spread(i, mean); }));
    const int pixels = picturePixels();
    const double high = risingMass(luma, kHighlights, kSlope);
    const double low = fallingMass(luma, kShadows, kSlope);
    params.m_P_C_H_C_F_L = limitOr(inverseShare(0.20000000298023224, low, pixels, 30), 40);
    params.m_P_C_H_C_F_H = limitOr(inverseShare(0.07699999958276749, high, pixels, 50), 60);
    Log::log(LogLevel::Debug, "CSmartAnalyzer_Digital_Flash complete.");
}
