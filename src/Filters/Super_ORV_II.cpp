#include "Filters/Super_ORV_II.h"

#include "Utility/Logger.h"

#include <utility>

using namespace orvela;

Super_ORV_II::Super_ORV_II(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : IFilter(params, inPlane, outPlane) {
    mName = "Super_ORV_II";
}

bool Super_ORV_II::PreApply() {
    Log::log(LogLevel::Debug, "Applying Super_ORV_II filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    const CSliderParams& sliders = mParams->mSliderParams;
    if (!sliders.OrvelaLevelEnabled && !sliders.OrvelaLevel2Enabled)
        return false;
    const double level = (static_cast<double>(sliders.OrvelaLevelValue) + sliders.OrvelaLevel2Value) / 2;
    const auto share = static_cast<float>((level * 41 / 1000 + 30) / 100 / 0.7 * 0.3);
    mThreshold = share + 0.5;
    return true;
}

void Super_ORV_II::ApplyRow(std::uint32_t row) {
    const int y = static_cast<int>(row);
    const ConstRow host = hostRow(y);
    const ConstRow in = std::as_const(*mInPlane).row(y);
    const Row out = mOutPlane->row(y);
    // An input of 0 gives an infinite or undefined ratio, which is never below the threshold.
    const auto tooBright = [&](std::size_t c, int x) {
        return static_cast<float>(host[c][x]) / static_cast<float>(in[c][x]) < mThreshold;
    };
    for (int x = 0; x < mInPlane->width(); ++x) {
        const ConstRow& source = tooBright(0, x) || tooBright(1, x) || tooBright(2, x) ? host : in;
        for (std::size_t c = 0; c < 3; ++c)
            out[c][x] = source[c][x];
    }
}

bool Super_ORV_II::PostApply() {
    Log::log(LogLevel::Debug, "Blur Filter complete.");
    return true;
}
