#include "Filters/Curves/TonalStretch.h"

#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

namespace orvela {

namespace TonalStretch {

std::optional<int> scanLeft(const Histogram& bins, double threshold, int last) {
    for (int i = 0; i <= last; ++i) {
        if (threshold < bins[static_cast<std::size_t>(i)])
            return i;
    }
    return std::nullopt;
}

std::optional<int> scanRight(const Histogram& bins, double threshold, int last) {
    for (int i = 255; i >= last; --i) {
        if (threshold < bins[static_cast<std::size_t>(i)])
            return i;
    }
    return std::nullopt;
}

double baseThreshold(int pixels) {
    const double root = std::sqrt(static_cast<double>(pixels));
    return root > 700 ? 0.1 * root : 0;
}

Limits combine(const std::array<Limits, 3>& channels) {
    const auto& [r, g, b] = channels;
    return {std::min({r.black, g.black, b.black}), std::max({r.white, g.white, b.white})};
}

std::array<const Histogram*, 3> channelHistograms(const CUserParams& params) {
    return {&params.pHisto_Red, &params.pHisto_Green, &params.pHisto_Blue};
}

namespace {

void scanLuma(const Histogram& luma, double threshold, Limits& limits) {
    if (const auto i = scanLeft(luma, threshold, 255)) {
        limits.black = *i;
        Log::log(LogLevel::Debug, "i= C_Left_limit:%d %f", *i, static_cast<double>(*i));
    }
    if (const auto i = scanRight(luma, threshold, 1)) {
        limits.white = *i;
        Log::log(LogLevel::Debug, "i= C_Right_limit:%d %f", *i, static_cast<double>(*i));
    }
}

} // namespace

bool storeHaze(CUserParams& params, Limits& limits, double threshold, double hazyThreshold) {
    scanLuma(params.pHisto_Luma, threshold, limits);
    params.m_Opaco = limits.isHazy();
    if (!params.m_Opaco)
        return false;
    Log::log(LogLevel::Debug, "C_Left_limit: %f ", static_cast<double>(limits.black));
    Log::log(LogLevel::Debug, "C_Right_limit: %f ", static_cast<double>(limits.white));
    scanLuma(params.pHisto_Luma, hazyThreshold, limits);
    return true;
}

int stretchHazy(int value, Limits limits) {
    const int range = limits.white - limits.black;
    if (range == 0)
        return value;
    const int above = std::max(value - limits.black, 0);
    return std::min(above + (255 - range) * above / range, 255);
}

float pullShadows(float value, float black) {
    const auto pulled = static_cast<float>(value - (1 - value / 255.0) * black);
    return std::max(pulled, 0.0F);
}

float liftHighlights(float value, float white) {
    const auto lifted = static_cast<float>(value + (1 - (255.0 - value) / 255) * (255.0 - white));
    return std::min(lifted, 255.0F);
}

} // namespace TonalStretch

} // namespace orvela
