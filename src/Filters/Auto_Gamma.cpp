#include "Filters/Auto_Gamma.h"

#include "Filters/Curves/GammaCurve.h"
#include "Filters/Kernels/PixelMath.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <cmath>

using namespace orvela;

const TaskDescription& Auto_Gamma::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/Auto_Gamma",
        .line = 107,
        .dumpName = "Auto_Gamma",
        .opening = "Applying Auto_Gamma from plane at 0x%x to plane at 0x%x...",
        .matched = "Auto_Gamma Condition matched.",
    };
    return kDescription;
}

bool Auto_Gamma::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return isAutomaticMode(sliders) || sliders.mAuto_Color_Enabled;
}

void Auto_Gamma::setUp() {
    measured([this] { addSamplesToHistogram(); });
    const float gamma = gammaFor(meanLuma());
    Log::log(LogLevel::Debug, "Level_M %f", static_cast<double>(gamma));
    mTable = GammaCurve::table(gamma);
}

// What the histogram already holds stays.
void Auto_Gamma::addSamplesToHistogram() {
    const CARGBPlane& in = *mInPlane;
    const int step = PixelMath::samplingStep(in.width(), in.height());
    Log::log(LogLevel::Debug, "Histo_Step %d", step);
    for (int y = 0; y < in.height() - step; y += step) {
        const ConstRow row = in.row(y);
        for (int x = 0; x < in.width() - step; x += step)
            mParams->pHisto_Luma[static_cast<std::size_t>((row[0][x] + row[1][x] + row[2][x]) / 3)] += 1;
    }
}

// NaN for an empty histogram.
float Auto_Gamma::meanLuma() const {
    double weighted = 0;
    double count = 0;
    for (std::size_t i = 0; i < mParams->pHisto_Luma.size(); ++i) {
        weighted += static_cast<double>(i) * mParams->pHisto_Luma[i];
        count += mParams->pHisto_Luma[i];
    }
    const auto mean = static_cast<float>(weighted / count);
    Log::log(LogLevel::Debug, "acu %f", weighted);
    Log::log(LogLevel::Debug, "acount %f", count);
    Log::log(LogLevel::Debug, "gamma_Shift_factor %f", static_cast<double>(mean));
    return mean;
}

float Auto_Gamma::gammaFor(float mean) const {
    if (mean < 100)
        return static_cast<float>(mBaseFactor * 1.35);
    if (mean <= 127)
        return static_cast<float>((7.5018 - 1.332 * std::log(static_cast<double>(mean))) * mBaseFactor);
    return 1.0F;
}

void Auto_Gamma::mapRow(const PixelRow& row) const {
    mapChannels(mTable, row);
}
