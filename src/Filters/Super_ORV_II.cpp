#include "Filters/Super_ORV_II.h"

using namespace orvela;

const TaskDescription& Super_ORV_II::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/Super_ORV_II",
        .dumpName = "Super_ORV_II",
        .start = "Applying Super_ORV_II filter from plane at 0x%x to plane at 0x%x...",
        .completion = "Blur Filter complete.",
        .testsStop = false,
    };
    return kDescription;
}

bool Super_ORV_II::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled;
}

void Super_ORV_II::setUp() {
    useHostPicture();
    const CSliderParams& sliders = mParams->mSliderParams;
    const double level = (static_cast<double>(sliders.OrvelaLevelValue) + sliders.OrvelaLevel2Value) / 2;
    const auto share = static_cast<float>((level * 41 / 1000 + 30) / 100 / 0.7 * 0.3);
    mThreshold = share + 0.5;
}

void Super_ORV_II::mapRow(const PixelRow& row) const {
    const ConstRow host = hostRow(row.y);
    // An input of 0 gives an infinite or undefined ratio, which is never below the threshold.
    const auto tooBright = [&](std::size_t c, int x) {
        return static_cast<float>(host[c][x]) / static_cast<float>(row.in[c][x]) < mThreshold;
    };
    for (int x = 0; x < row.width; ++x) {
        const ConstRow& source = tooBright(0, x) || tooBright(1, x) || tooBright(2, x) ? host : row.in;
        for (std::size_t c = 0; c < 3; ++c)
            row.out[c][x] = source[c][x];
    }
}
