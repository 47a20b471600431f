#include "Filters/CAuto_Contrast_I.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

// 3 * 255: normalised ratios, which sum to 1, bring the mean luma to 127.5.
constexpr double RatioScale = 765;

float ratioOf(float before, float after) {
    return after == 0 ? before : before / after;
}

// What an illumination iteration adds to the fade; nothing at low positions.
float iterationShare(bool enabled, float value) {
    if (!enabled || value <= 268)
        return 0;
    return static_cast<float>((static_cast<double>(value) / 1000 * 41 + 30 - 40) / 31);
}

} // namespace

const TaskDescription& CAuto_Contrast_I::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CAuto_Contrast_I",
        .line = 171,
        .dumpName = "CAuto_Contrast_I",
        .start = "Applying CAuto_Contrast_I filter from plane at 0x%x to plane at 0x%x.",
        .completion = "CAuto_Contrast_I Filter complete.",
    };
    return kDescription;
}

bool CAuto_Contrast_I::applies() {
    storeSharpnessSwitch();
    const CUserParams& p = *mParams;
    const CSliderParams& sliders = p.mSliderParams;
    return (sliders.OrvelaLevelEnabled || sliders.OrvelaLevel2Enabled) && !p.Switch_TOO_SHARP &&
           p.Normal_Picture && !p.Under_Exposed_Picture;
}

void CAuto_Contrast_I::storeSharpnessSwitch() {
    CUserParams& p = *mParams;
    p.Switch_TOO_SHARP = p.Switch_TOO_SHARP_ORV_I && p.Switch_TOO_SHARP_ORV_II;
    Log::log(LogLevel::Debug, "mSum_Color %f", p.mSum_Color);
    Log::log(LogLevel::Debug, "Switch_TOO_SHARP auto contratst %d  %d", p.Switch_TOO_SHARP_ORV_II,
             p.Switch_TOO_SHARP_ORV_I);
}

void CAuto_Contrast_I::setUp() {
    Log::log(LogLevel::Debug, "CAuto_Contrast_I Condition matched and Soft_Orvela is %d.",
             mParams->Soft_Orvela);
    useHostPicture();
    prepareRatios();
    logRatios();
    const auto gains = [](float ratio) {
        return makeTable<WideTable>(
            [ratio](int value) { return PixelMath::trunc(static_cast<float>(value) * ratio); });
    };
    mGains = {gains(RatioR), gains(RatioG), gains(RatioB)};
    prepareFade();
}

void CAuto_Contrast_I::prepareRatios() {
    const CUserParams& p = *mParams;
    RatioR = ratioOf(p.m_OriginalLumaR0, p.m_OriginalLumaR);
    RatioG = ratioOf(p.m_OriginalLumaG0, p.m_OriginalLumaG);
    RatioB = ratioOf(p.m_OriginalLumaB0, p.m_OriginalLumaB);
    const auto logThree = [](const char* what, double r, double g, double b) {
        Log::log(LogLevel::Debug, "CAuto_Contrast_I Filter %s %f %f %f.", what, r, g, b);
    };
    logThree("m_OriginalLumaRGB0", p.m_OriginalLumaR0, p.m_OriginalLumaG0, p.m_OriginalLumaB0);
    logThree("m_OriginalLumaRGB", p.m_OriginalLumaR, p.m_OriginalLumaG, p.m_OriginalLumaB);
    logThree("Ratio*", RatioR, RatioG, RatioB);
    Log::log(LogLevel::Debug, "CAuto_Contrast_I OrvelaLight 1&2 %f %f .", static_cast<double>(p.OrvelaLight1),
             static_cast<double>(p.OrvelaLight2));

    float f = 1.0F;
    const float s = p.OrvelaLight1 + p.OrvelaLight2;
    if (s / 2 > 65)
        f = static_cast<float>((1.0631F - p.m_Light_Acu * 0.4025F) * s * 0.45F);
    const bool bright =
        2 * p.m_OriginalLumaR > 255 || 2 * p.m_OriginalLumaG > 255 || 2 * p.m_OriginalLumaB > 255;
    if (bright && RatioR > 1 && RatioG > 1 && RatioB > 1)
        normaliseRatios(f);
}

void CAuto_Contrast_I::normaliseRatios(float f) {
    const double sum = static_cast<double>(RatioB) + RatioR + RatioG;
    const auto m = static_cast<float>(RatioScale * f / (2 * static_cast<double>(mParams->m_OriginalLuma)));
    for (float* ratio : {&RatioR, &RatioG, &RatioB})
        *ratio = m * static_cast<float>(*ratio / sum);
}

void CAuto_Contrast_I::logRatios() const {
    const CUserParams& p = *mParams;
    const auto logOne = [](const char* name, float value) {
        Log::log(LogLevel::Debug, "%s %f", name, static_cast<double>(value));
    };
    logOne("m_OriginalLuma0:", p.m_OriginalLuma0);
    logOne("m_OriginalLumaR0:", p.m_OriginalLumaR0);
    logOne("m_OriginalLumaG0:", p.m_OriginalLumaG0);
    logOne("m_OriginalLumaB0:", p.m_OriginalLumaB0);
    logOne("m_OriginalLuma:", p.m_OriginalLuma);
    logOne("m_OriginalLumaR:", p.m_OriginalLumaR);
    logOne("m_OriginalLumaG:", p.m_OriginalLumaG);
    logOne("m_OriginalLumaB:", p.m_OriginalLumaB);
    logOne("RatioR:", RatioR);
    logOne("RatioG", RatioG);
    logOne("RatioB", RatioB);
}

float CAuto_Contrast_I::sharpnessFactor(std::int32_t pixelCount) {
    const auto pixels = static_cast<float>(pixelCount);
    const auto side = static_cast<float>(std::sqrt(static_cast<double>(pixels)));
    return static_cast<float>((std::tanh((1500.0 - side) / 750) + 1) * 0.5 / 2 + 0.5);
}

void CAuto_Contrast_I::prepareFade() {
    const CSliderParams& sliders = mParams->mSliderParams;
    const float share = sliders.mFade_Value / 1000;
    const float a = iterationShare(sliders.OrvelaLevelEnabled, sliders.OrvelaLevelValue);
    const float b = iterationShare(sliders.OrvelaLevel2Enabled, sliders.OrvelaLevel2Value);
    const auto g = static_cast<float>((static_cast<double>(a) + b) / 10 + 1.1);
    const float Sharpness_factor = sharpnessFactor(picturePixels());
    Log::log(LogLevel::Debug, "Sharpness_factor: %f", static_cast<double>(Sharpness_factor));
    const auto w = static_cast<float>(static_cast<double>(share) * Sharpness_factor * g);
    Fade_Value_factor = std::min(w, 1.0F);
    Fade_Inverse = std::max(1.0F - w, 0.0F);
}

// In double and stored as a float: a pixel equal to the host's keeps its value at any weight.
int CAuto_Contrast_I::fade(int processed, int host) const {
    const double sum =
        host * static_cast<double>(Fade_Value_factor) + processed * static_cast<double>(Fade_Inverse);
    return PixelMath::trunc(static_cast<float>(sum));
}

void CAuto_Contrast_I::logOverflows(const PixelRow& balanced, const ConstRow& host) const {
    static constexpr std::array kNames = {"Red", "Green", "Blue"};
    const auto faded = [&](std::size_t c, int x) { return fade(balanced.out[c][x], host[c][x]); };
    for (int x = 0; x < balanced.width; ++x) {
        if (faded(0, x) <= 255 && faded(1, x) <= 255 && faded(2, x) <= 255)
            continue;
        for (std::size_t c = 0; c < 3; ++c) {
            Log::log(
                LogLevel::Debug, "int %c_tmp(%d) =%s(%d)*Fade_Inverse(%f)+%c_aux(%d)*Fade_Value_factor(%f);",
                kNames[c][0], faded(c, x), kNames[c], balanced.out[c][x], static_cast<double>(Fade_Inverse),
                kNames[c][0], host[c][x], static_cast<double>(Fade_Value_factor));
        }
    }
}

void CAuto_Contrast_I::mapRow(const PixelRow& row) const {
    const ConstRow host = hostRow(row.y);
    mapKeepingHue(mGains, row);
    if (row.y < 50 && Log::writes(LogLevel::Debug))
        logOverflows(row, host);
    for (std::size_t c = 0; c < 3; ++c) {
        for (int x = 0; x < row.width; ++x)
            row.out[c][x] = static_cast<std::uint8_t>(fade(row.out[c][x], host[c][x]));
    }
}
