#include "Filters/CColor.h"

#include "Utility/Logger.h"

#include <utility>

namespace {

Curve mix(float colour, float v, float keep) {
    Curve curve;
    for (std::size_t c = 0; c < curve.size(); ++c) {
        const double mixed = static_cast<double>(colour) * v + static_cast<double>(c) * keep;
        curve[c] = PixelMath::trunc(static_cast<float>(mixed));
    }
    return curve;
}

} // namespace

CColor::Tint::Tint(float intensity, float r, float g, float b)
    : v(intensity / 1000), keep(1.0F - v), red(mix(r, v, keep)), green(mix(g, v, keep)),
      blue(mix(b, v, keep)) {}

bool CColor::PreApply() {
    const CSliderParams& sliders = mParams->mSliderParams;
    if (!sliders.mColor_Effect_Intensity_Enabled && !sliders.mColor_Touch_Enabled)
        return false;
    Log::log(LogLevel::Debug, "Applying CColor filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !mParams->Final_Touch_Mode_Enabled);
    Log::log(LogLevel::Debug, "Color_Effect_Intensity_Enabled %d.", sliders.mColor_Effect_Intensity_Enabled);
    Log::log(LogLevel::Debug, "Color_Touch_Enabled     %d.", sliders.mColor_Touch_Enabled);
    if (mParams->Final_Touch_Mode_Enabled) {
        Log::log(LogLevel::Debug, "Final_Touch_Mode_Enabled  %d.", mParams->Final_Touch_Mode_Enabled);
        Log::log(LogLevel::Debug, "Color_Touch_Enabled %d.", sliders.mColor_Touch_Enabled);
        Log::log(LogLevel::Debug, "Color_Intensity_Touch_Value  %d.",
                 PixelMath::trunc(sliders.mColor_Intensity_Touch_Value));
        Log::log(LogLevel::Debug, "CColor Condition matched.");
        mTouch = Tint(sliders.mColor_Intensity_Touch_Value, sliders.mColor_Touch_Value_R,
                      sliders.mColor_Touch_Value_G, sliders.mColor_Touch_Value_B);
    } else {
        Log::log(LogLevel::Debug, "CColor Condition matched.");
        mNormal = Tint(sliders.mColor_Effect_Intensity_Value, sliders.mColor_Value_R, sliders.mColor_Value_G,
                       sliders.mColor_Value_B);
    }
    return true;
}

void CColor::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CColor", 92);
    const Tint& tint = mParams->Final_Touch_Mode_Enabled ? mTouch : mNormal;
    const ConstRow in = std::as_const(*mInPlane).row(static_cast<int>(row));
    const Row out = mOutPlane->row(static_cast<int>(row));
    for (int x = 0; x < mInPlane->width(); ++x) {
        const std::uint8_t r = in[0][x];
        const std::uint8_t g = in[1][x];
        const std::uint8_t b = in[2][x];
        const PixelMath::Rgb c =
            PixelMath::restoreMean({tint.red[r], tint.green[g], tint.blue[b]}, (r + g + b) / 3);
        out[0][x] = static_cast<std::uint8_t>(c.r);
        out[1][x] = static_cast<std::uint8_t>(c.g);
        out[2][x] = static_cast<std::uint8_t>(c.b);
    }
}
