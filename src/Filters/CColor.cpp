#include "Filters/CColor.h"

#include "Utility/Logger.h"

using namespace orvela;

namespace {

WideTable mix(float colour, float v, float keep) {
    return makeTable<WideTable>([=](int c) {
        const double mixed = static_cast<double>(colour) * v + static_cast<double>(c) * keep;
        return PixelMath::trunc(static_cast<float>(mixed));
    });
}

WideTables tint(float intensity, float r, float g, float b) {
    const float v = intensity / 1000;
    const float keep = 1.0F - v;
    return {mix(r, v, keep), mix(g, v, keep), mix(b, v, keep)};
}

} // namespace

const TaskDescription& CColor::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CColor",
        .line = 92,
        .opening = "Applying CColor filter from plane at 0x%x to plane at 0x%x...",
    };
    return kDescription;
}

bool CColor::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.mColor_Effect_Intensity_Enabled || sliders.mColor_Touch_Enabled;
}

void CColor::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool touch = mParams->Final_Touch_Mode_Enabled;
    Log::log(LogLevel::Debug, "!Final_Touch_Mode_Enabled  %d.", !touch);
    Log::log(LogLevel::Debug, "Color_Effect_Intensity_Enabled %d.", sliders.mColor_Effect_Intensity_Enabled);
    Log::log(LogLevel::Debug, "Color_Touch_Enabled     %d.", sliders.mColor_Touch_Enabled);
    if (touch) {
        Log::log(LogLevel::Debug, "Final_Touch_Mode_Enabled  %d.", touch);
        Log::log(LogLevel::Debug, "Color_Touch_Enabled %d.", sliders.mColor_Touch_Enabled);
        Log::log(LogLevel::Debug, "Color_Intensity_Touch_Value  %d.",
                 PixelMath::trunc(sliders.mColor_Intensity_Touch_Value));
        mTint = tint(sliders.mColor_Intensity_Touch_Value, sliders.mColor_Touch_Value_R,
                     sliders.mColor_Touch_Value_G, sliders.mColor_Touch_Value_B);
    } else {
        mTint = tint(sliders.mColor_Effect_Intensity_Value, sliders.mColor_Value_R, sliders.mColor_Value_G,
                     sliders.mColor_Value_B);
    }
    Log::log(LogLevel::Debug, "CColor Condition matched.");
}

void CColor::mapRow(const PixelRow& row) const {
    mapPixels(row, [this](std::uint8_t r, std::uint8_t g, std::uint8_t b) {
        return PixelMath::restoreMean({mTint[0][r], mTint[1][g], mTint[2][b]}, (r + g + b) / 3);
    });
}
