#include "Filters/CGamma_Perceptual.h"

#include "Filters/Curves/GammaCurve.h"
#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

CGamma_Perceptual::CGamma_Perceptual(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : IFilter(params, inPlane, outPlane) {
    mName = "CGamma_Perceptual";
}

bool CGamma_Perceptual::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    Log::log(LogLevel::Debug, "Applying Gamma_Perceptual filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    if (!sliders.PerceptualGammaEnabled || sliders.mAuto_Color_Enabled)
        return false;
    Log::log(LogLevel::Debug, "CGamma_Perceptual 1st Condition matched.");
    const float gamma = sliders.GammaCorrectionEnabled ? 1.0F : perceptualGamma();
    if (gamma != 1)
        Log::log(LogLevel::Debug, "CGamma_Perceptual 2nd Condition matched.");
    mTable = GammaCurve::table(gamma);
    return true;
}

float CGamma_Perceptual::perceptualGamma() const {
    const double v = mParams->mSliderParams.PerceptualGamma;
    if (v < 500) {
        const double low = mParams->m_M_H_L_F;
        return static_cast<float>((1 - low) * v / 500 + low);
    }
    if (mParams->m_M_H_H_F > 1)
        mParams->m_M_H_H_F -= 1;
    return static_cast<float>((v - 500) / 500 * mParams->m_M_H_H_F + 1);
}

void CGamma_Perceptual::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CGamma_Perceptual", 61);
    const int y = static_cast<int>(row);
    mapRow(mTable, std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width());
}

bool CGamma_Perceptual::PostApply() {
    Log::log(LogLevel::Debug, "CGamma_Perceptual Filter complete.");
    return true;
}
