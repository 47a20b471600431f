#include "Filters/CGamma_Perceptual.h"

#include "Filters/Curves/GammaCurve.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CGamma_Perceptual::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CGamma_Perceptual",
        .line = 61,
        .dumpName = "CGamma_Perceptual",
        .start = "Applying Gamma_Perceptual filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CGamma_Perceptual 1st Condition matched.",
        .completion = "CGamma_Perceptual Filter complete.",
    };
    return kDescription;
}

bool CGamma_Perceptual::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.PerceptualGammaEnabled && !sliders.mAuto_Color_Enabled;
}

void CGamma_Perceptual::setUp() {
    const float gamma = mParams->mSliderParams.GammaCorrectionEnabled ? 1.0F : takeGamma();
    if (gamma != 1)
        Log::log(LogLevel::Debug, "CGamma_Perceptual 2nd Condition matched.");
    mTable = GammaCurve::table(gamma);
}

// Lowers the factor that it uses up.
float CGamma_Perceptual::takeGamma() {
    const double v = mParams->mSliderParams.PerceptualGamma;
    if (v < 500) {
        const double low = mParams->m_M_H_L_F;
        return static_cast<float>((1 - low) * v / 500 + low);
    }
    if (mParams->m_M_H_H_F > 1)
        mParams->m_M_H_H_F -= 1;
    return static_cast<float>((v - 500) / 500 * mParams->m_M_H_H_F + 1);
}

void CGamma_Perceptual::mapRow(const PixelRow& row) const {
    mapChannels(mTable, row);
}
