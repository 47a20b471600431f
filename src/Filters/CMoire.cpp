#include "Filters/CMoire.h"

using namespace orvela;

const TaskDescription& CMoire::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CMoire",
        .line = 52,
        .start = "Applying CMoire filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CMoire Condition matched.",
        .completion = "CMoire Filter complete.",
    };
    return kDescription;
}

bool CMoire::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const bool otherCorrections = sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled ||
                                  sliders.ContrastEnabled || sliders.BrightnessEnabled;
    return sliders.Moire_Enabled && !otherCorrections && !mParams->Switch_TOO_SHARP &&
           !mParams->Under_Exposed_Picture;
}

void CMoire::setUp() {
    useHostPicture();
    mKernel.emplace(mParams->mSliderParams.mMoire_Value);
}

void CMoire::ApplyRow(std::uint32_t row) {
    const int y = static_cast<int>(row);
    mKernel->applyRow(*mInPlane, hostRow(y), *mOutPlane, y);
}
