#include "Filters/CGamma_Simple_Filter.h"

#include "Filters/Curves/GammaCurve.h"
#include "Filters/Curves/LevelMath.h"

using namespace orvela;

const TaskDescription& CGamma_Simple_Filter::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CGamma_Simple_Filter",
        .line = 63,
        .opening = "Applying Gamma_Simple_Filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CGamma_Simple_Filter Condition matched.",
        .completion = "CGamma_Simple_Filter Filter complete.",
    };
    return kDescription;
}

bool CGamma_Simple_Filter::applies() {
    return mParams->mSliderParams.GammaCorrectionEnabled;
}

void CGamma_Simple_Filter::setUp() {
    mTable = GammaCurve::table(LevelMath::sliderToGamma(mParams->mSliderParams.GammaCorrectionValue));
}

void CGamma_Simple_Filter::mapRow(const PixelRow& row) const {
    mapChannels(mTable, row);
}
