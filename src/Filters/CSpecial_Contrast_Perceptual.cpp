#include "Filters/CSpecial_Contrast_Perceptual.h"

using namespace orvela;

namespace {

/// Mass of one channel's highlights and shadows.
struct ChannelMass {
    double high;
    double low;

    bool isMissing() const { return high < 0.05 * low; }
    bool isPresent() const { return high > 0.25 * low; }
    float tint() const {
        const auto ratio = static_cast<float>((low + 1) / (high + 1));
        return static_cast<float>(ratio <= 21 ? static_cast<double>(ratio) / 20 * 0.15 : 0.15);
    }
};

} // namespace

const TaskDescription& CSpecial_Contrast_Perceptual::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CSpecial_Contrast_Perceptual",
        .line = 76,
        .start = "Applying CSpecial_Contrast_Perceptual filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CSpecial_Contrast_Perceptual Condition matched.",
        .completion = "CSpecial_Contrast_Perceptual filter complete.",
    };
    return kDescription;
}

bool CSpecial_Contrast_Perceptual::applies() {
    const CSliderParams& sliders = mParams->mSliderParams;
    return sliders.Contrast2Enabled && !sliders.mAuto_Color_Enabled && !mParams->Under_Exposed_Picture;
}

void CSpecial_Contrast_Perceptual::setUp() {
    findTint();
    const double keep = 1 - mTint;
    for (std::size_t channel = 0; channel < mTables.size(); ++channel) {
        const double added = static_cast<double>(mTint) * mTarget[channel];
        mTables[channel] = makeTable(
            [keep, added](int c) { return PixelMath::trunc(static_cast<float>(c * keep + added)); });
    }
}

// At most one primary can be missing while the others are present.
void CSpecial_Contrast_Perceptual::findTint() {
    const std::array<ChannelMass, 3> masses = {{{mParams->C_H_F_High_R, mParams->C_H_F_Low_R},
                                                {mParams->C_H_F_High_G, mParams->C_H_F_Low_G},
                                                {mParams->C_H_F_High_B, mParams->C_H_F_Low_B}}};
    for (std::size_t channel = 0; channel < masses.size(); ++channel) {
        const bool othersPresent =
            masses[(channel + 1) % 3].isPresent() && masses[(channel + 2) % 3].isPresent();
        if (!masses[channel].isMissing() || !othersPresent)
            continue;
        mTarget[channel] = 255;
        mTint = masses[channel].tint();
    }
}

void CSpecial_Contrast_Perceptual::mapRow(const PixelRow& row) const {
    mapPixels(row, [this](std::uint8_t r, std::uint8_t g, std::uint8_t b) {
        return PixelMath::restoreMean({mTables[0][r], mTables[1][g], mTables[2][b]}, (r + g + b) / 3);
    });
}
