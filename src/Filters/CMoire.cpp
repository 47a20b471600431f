#include "Filters/CMoire.h"

#include "Utility/Logger.h"

using namespace orvela;

bool CMoire::PreApply() {
    Log::log(LogLevel::Debug, "Applying CMoire filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool otherCorrections = sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled ||
                                  sliders.ContrastEnabled || sliders.BrightnessEnabled;
    if (!sliders.Moire_Enabled || otherCorrections || mParams->Switch_TOO_SHARP ||
        mParams->Under_Exposed_Picture)
        return false;
    Log::log(LogLevel::Debug, "CMoire Condition matched.");
    mKernel.emplace(sliders.mMoire_Value);
    return true;
}

void CMoire::ApplyRow(std::uint32_t row) {
    beginRow(row, "Filters/CMoire", 52);
    const int y = static_cast<int>(row);
    mKernel->applyRow(*mInPlane, hostRow(y), *mOutPlane, y);
}

bool CMoire::PostApply() {
    mKernel.reset();
    Log::log(LogLevel::Debug, "CMoire Filter complete.");
    return true;
}
