#include "run/ModeNames.h"

#include "Settings/PresetConversion.h"
#include "Settings/SettingFields.h"
#include "run/NearestNames.h"

#include <algorithm>
#include <cctype>
#include <cstring>

namespace orvela {

namespace ModeNames {

std::vector<const ModeDescription*> selectable() {
    std::vector<const ModeDescription*> modes;
    for (const ModeDescription& mode : ModeTable::all())
        if (mode.hasSettings && mode.mode != Mode_Custom && mode.mode != Mode_FinalTouch)
            modes.push_back(&mode);
    return modes;
}

std::vector<const ModeDescription*> withPresets() {
    std::vector<const ModeDescription*> modes;
    for (const ModeDescription& mode : ModeTable::all())
        if (PresetConversion::hasControls(mode.mode))
            modes.push_back(&mode);
    return modes;
}

std::string identifierOf(const ModeDescription& mode) {
    // The only mode whose display name belongs to another one as well.
    if (mode.mode == Mode_AutoColorFilter)
        return "AutoColorFilter";
    std::string identifier = mode.presetName ? mode.presetName : mode.displayName;
    std::erase_if(identifier, [](unsigned char c) { return !std::isalnum(c); });
    return identifier;
}

const ModeDescription* find(std::string_view name, const std::vector<const ModeDescription*>& modes) {
    const std::string wanted = NearestNames::plain(name);
    for (const ModeDescription* mode : modes)
        if (wanted == NearestNames::plain(mode->displayName) ||
            wanted == NearestNames::plain(identifierOf(*mode)))
            return mode;
    return nullptr;
}

std::vector<NamedSlider> slidersOf(EGUIMode mode) {
    std::vector<NamedSlider> sliders;
    if (const PaneSlider* single = PaneTable::single(mode))
        sliders.push_back({"--value", single->slider});
    for (const PaneSlider& each : PaneTable::threeSliders(mode))
        sliders.push_back({"--" + NearestNames::plain(each.slider.label), each.slider});
    return sliders;
}

std::span<const PaneColor> colorsOf(EGUIMode mode) {
    return slidersOf(mode).empty() ? std::span<const PaneColor>() : PaneTable::colors(mode);
}

std::vector<NamedSlider> settings() {
    std::vector<NamedSlider> sliders;
    for (const SliderField& field : sliderFields()) {
        const SliderDescription* slider = SettingFields::sliderOf(field);
        if (slider && slider->stage == SettingStage::Main && (field.value || !slider->value))
            sliders.push_back({field.name, *slider});
    }
    return sliders;
}

std::vector<NamedSlider> finalTouchSliders() {
    std::vector<NamedSlider> sliders;
    for (const PaneSlider& each : PaneTable::sliders(Mode_FinalTouch))
        sliders.push_back({each.object + std::strlen("sldr"), each.slider});
    return sliders;
}

std::vector<std::string> identifiers() {
    std::vector<std::string> names;
    for (const ModeDescription* mode : selectable())
        names.push_back(identifierOf(*mode));
    return names;
}

} // namespace ModeNames

} // namespace orvela
