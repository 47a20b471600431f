#include "Filters/COrv_I_Iter.h"

#include "Filters/Kernels/PixelMath.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& COrv_I_Iter::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/COrv_I_Iter",
        .line = 115,
        .dumpName = "COrv_I_Iter",
        .start = "Applying COrv_I_Iter filter from plane at 0x%x to plane at 0x%x...",
        .matched = "COrv_I_Iter Condition matched.",
        .completion = "Orv_I_Iter Filter complete.",
    };
    return kDescription;
}

bool COrv_I_Iter::applies() {
    storeSharpnessSwitch();
    const CSliderParams& sliders = mParams->mSliderParams;
    Log::log(LogLevel::Debug, "Orvela_Level_Enabled %d", sliders.OrvelaLevelEnabled);
    Log::log(LogLevel::Debug, "Normal_Picture %d", mParams->Normal_Picture);
    Log::log(LogLevel::Debug, "!Under_Exposed_Picture %d", !mParams->Under_Exposed_Picture);
    return !mParams->Switch_TOO_SHARP_ORV_I && sliders.OrvelaLevelEnabled && mParams->Normal_Picture &&
           !mParams->Under_Exposed_Picture;
}

void COrv_I_Iter::storeSharpnessSwitch() {
    Log::log(LogLevel::Debug, "mSum_Color %f", mParams->mSum_Color);
    mParams->Switch_TOO_SHARP_ORV_I = isTooSharpFor(*mParams, 0.25);
    Log::log(LogLevel::Debug, "Switch_TOO_SHARP ORV I %d", mParams->Switch_TOO_SHARP_ORV_I);
}

void COrv_I_Iter::setUp() {
    const CSliderParams& sliders = mParams->mSliderParams;
    Log::log(LogLevel::Debug, "Orvela_Level_Value Second Iteration: %f",
             static_cast<double>(sliders.OrvelaLevelValue));

    const double level = static_cast<double>(sliders.OrvelaLevelValue) * 31 / 1000 + 30;
    const auto lightness = static_cast<float>(PixelMath::trunc(level * 0.85F));
    const auto dEpsilon = static_cast<float>(PixelMath::trunc(lightness * 3));
    mParams->OrvelaLight1 = lightness;
    if (static_cast<double>(lightness) / 0.85F > 70)
        mParams->Soft_Orvela = false;
    mKernel.emplace(dEpsilon, mInPlane->pixelCount());

    Log::log(LogLevel::Debug, "Orvela_Lightness %f", static_cast<double>(lightness));
    Log::log(LogLevel::Debug, "dEpsilon  %f", static_cast<double>(dEpsilon));
    Log::log(LogLevel::Debug, "mSum_Color  %f", mParams->mSum_Color);
}

void COrv_I_Iter::ApplyRow(std::uint32_t row) {
    mKernel->applyRow(*mInPlane, *mOutPlane, static_cast<int>(row));
}
