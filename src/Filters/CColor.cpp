#include "Filters/CColor.h"

#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

namespace {

WideTable mix(float colour, float v, float keep) {
    return makeTable<WideTable>([=](int c) {
        const double mixed = static_cast<double>(colour) * v + static_cast<double>(c) * keep;
        return PixelMath::trunc(static_cast<float>(mixed));
    });
}

} // namespace

CColor::Tint::Tint(float intensity, float r, float g, float b)
    : v(intensity / 1000), keep(1.0F - v), curves{mix(r, v, keep), mix(g, v, keep), mix(b, v, keep)} {}

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
    const int y = static_cast<int>(row);
    const auto recolour = [&tint](std::uint8_t r, std::uint8_t g, std::uint8_t b) {
        return PixelMath::restoreMean({tint.curves[0][r], tint.curves[1][g], tint.curves[2][b]},
                                      (r + g + b) / 3);
    };
    mapPixels(std::as_const(*mInPlane).row(y), mOutPlane->row(y), mInPlane->width(), recolour);
}
