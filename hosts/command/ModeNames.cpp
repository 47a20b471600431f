#include "command/ModeNames.h"

#include "Settings/PresetConversion.h"
#include "Settings/SettingFields.h"

#include <algorithm>
#include <cctype>
#include <cstring>
#include <numeric>

namespace orvela {

namespace {

// Fewest insertions, deletions and replacements that turn one text into the other.
std::size_t editDistance(std::string_view from, std::string_view to) {
    std::vector<std::size_t> row(to.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 1; i <= from.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i;
        for (std::size_t j = 1; j <= to.size(); ++j) {
            const std::size_t replaced = diagonal + (from[i - 1] == to[j - 1] ? 0 : 1);
            diagonal = row[j];
            row[j] = std::min({row[j] + 1, row[j - 1] + 1, replaced});
        }
    }
    return row.back();
}

} // namespace

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

std::string plain(std::string_view name) {
    std::string text;
    for (const unsigned char c : name)
        if (std::isalnum(c))
            text += static_cast<char>(std::tolower(c));
    return text;
}

const ModeDescription* find(std::string_view name, const std::vector<const ModeDescription*>& modes) {
    const std::string wanted = plain(name);
    for (const ModeDescription* mode : modes)
        if (wanted == plain(mode->displayName) || wanted == plain(identifierOf(*mode)))
            return mode;
    return nullptr;
}

std::vector<NamedSlider> slidersOf(EGUIMode mode) {
    std::vector<NamedSlider> sliders;
    if (const PaneSlider* single = PaneTable::single(mode))
        sliders.push_back({"--value", single->slider});
    for (const PaneSlider& each : PaneTable::threeSliders(mode))
        sliders.push_back({"--" + plain(each.slider.label), each.slider});
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

std::vector<std::string> nearest(std::string_view name) {
    const std::string wanted = plain(name);
    std::vector<std::pair<std::size_t, std::string>> ranked;
    for (const ModeDescription* mode : selectable()) {
        const std::string identifier = identifierOf(*mode);
        ranked.emplace_back(editDistance(wanted, plain(identifier)), identifier);
    }
    std::stable_sort(ranked.begin(), ranked.end(),
                     [](const auto& a, const auto& b) { return a.first < b.first; });
    std::vector<std::string> names;
    // Beyond the nearest only names that are about as near, or the answer is noise.
    for (const auto& [distance, identifier] : ranked)
        if (names.size() < 3 && distance <= ranked.front().first + 1)
            names.push_back(identifier);
    return names;
}

} // namespace ModeNames

} // namespace orvela
