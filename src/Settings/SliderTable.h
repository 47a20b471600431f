#pragma once

#include "Settings/CSliderParams.h"
#include "Settings/SliderScale.h"

#include <array>
#include <cstdint>
#include <span>

namespace orvela {

/// The stage of a run that reads a setting.
enum class SettingStage { Main, FinalTouch };

/// The sets of track colours that tell mild from strong and extreme positions.
enum class ZoneSet : std::int32_t {
    Standard = 1,          ///< mild, then strong, then extreme
    CentredWide = 2,       ///< mild in the middle and far above it
    NeutralLight = 3,      ///< one light colour
    Neutral = 4,           ///< one colour
    CentredFinal = 5,      ///< mild in the middle and above it
    Sharpness = 6,         ///< as Standard, strong later
    Illumination = 7,      ///< mild, then strong
    Strength = 8,          ///< as Illumination, strong earlier
    Blur = 9,              ///< as Standard, strong early
    Fade = 10,             ///< extreme, then strong, then mild
    NeutralSingle = 11,    ///< as Neutral, in the modes with one slider
    CentredGamma = 12,     ///< mild in the middle
    CentredFinalPale = 13, ///< as CentredFinal, strong ones paler
};

/// One slider, described once: panes, command line, presets and help go by this. Label and help are texts of
/// the translation context "SliderTable".
struct SliderDescription {
    float CSliderParams::*value;  ///< field that holds the position; null when only the state counts
    bool CSliderParams::*enabled; ///< field that holds the on/off state; no two sliders share one
    const char* label;            ///< text shown beside it
    const SliderScale* scale;     ///< position and shown number
    SettingStage stage;
    ZoneSet zones;
    const char* help; ///< what it does and which end does what, in one sentence
};

/// One colour that is picked, described once.
struct ColorDescription {
    std::array<float CSliderParams::*, 3> parts; ///< fields that hold red, green and blue, 0 to 255 each
    SettingStage stage;
    const char* help; ///< what it does, in one sentence
};

namespace SliderTable {

/// Every slider, those of the main stage first.
std::span<const SliderDescription> sliders();

/// The slider with that switch. @throws std::out_of_range
const SliderDescription& slider(bool CSliderParams::*enabled);

/// The colour of each stage.
std::span<const ColorDescription> colors();

/// The colour of the stage.
const ColorDescription& color(SettingStage stage);

} // namespace SliderTable

} // namespace orvela
