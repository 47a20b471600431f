#include "SmartAnalyzers/ToneMass.h"

#include "Filters/Kernels/HistogramRecount.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

constexpr unsigned kRecountRowStep = 5;
constexpr unsigned kRecountColumnStep = 1;

template <typename Weight>
double weighedSum(const Histogram& bins, Weight weight) {
    double sum = 0;
    for (int i = 0; i < 256; ++i)
        sum += static_cast<double>(weight(i)) * bins[static_cast<std::size_t>(i)];
    return sum;
}

int leftLimitOf(const Histogram& bins, const char* name) {
    for (std::size_t i = 0; i + 2 < bins.size(); ++i) {
        if (bins[i] > 0 && bins[i + 1] > 0 && bins[i + 2] > 0) {
            Log::log(LogLevel::Debug, "%s: %d", name, static_cast<int>(i));
            return static_cast<int>(i);
        }
    }
    return 0;
}

int rightLimitOf(const Histogram& bins, const char* name) {
    for (std::size_t i = bins.size() - 1; i >= 2; --i) {
        if (bins[i] > 0 && bins[i - 1] > 0) {
            Log::log(LogLevel::Debug, "%s: %d", name, static_cast<int>(i));
            return static_cast<int>(i);
        }
    }
    return 255;
}

} // namespace

namespace ToneMass {

Histogram remap(const Histogram& bins, const Curve& curve) {
    Histogram moved = {};
    for (std::size_t i = 0; i < bins.size(); ++i) {
        const int j = target(curve, i);
        if (j >= 0 && j <= 255)
            moved[static_cast<std::size_t>(j)] += bins[i];
    }
    return moved;
}

float risingStep(int i, double center, double slope) {
    return static_cast<float>((std::tanh((i - center) / slope) + 1) / 2);
}

double risingMass(const Histogram& bins, double center, double slope) {
    return weighedSum(bins, [=](int i) { return risingStep(i, center, slope); });
}

double fallingMass(const Histogram& bins, double center, double slope) {
    return weighedSum(bins, [=](int i) { return 1.0F - risingStep(i, center, slope); });
}

double inverseShare(double scale, double mass, int pixels, double gain) {
    return mass > 0 ? scale / (mass / pixels) * gain : 0;
}

int leftLimit(const CUserParams& params) {
    return std::min({leftLimitOf(params.pHisto_Red, "Left_Limit_R"),
                     leftLimitOf(params.pHisto_Green, "Left_Limit_G"),
                     leftLimitOf(params.pHisto_Blue, "Left_Limit_B")});
}

int rightLimit(const CUserParams& params) {
    return std::max({rightLimitOf(params.pHisto_Red, "Right_Limit_R"),
                     rightLimitOf(params.pHisto_Green, "Right_Limit_G"),
                     rightLimitOf(params.pHisto_Blue, "Right_Limit_B")});
}

void recount(const CARGBPlane& plane, CUserParams& params) {
    recountHistograms(plane, params, kRecountRowStep, kRecountColumnStep);
}

} // namespace ToneMass

} // namespace orvela
