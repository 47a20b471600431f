#pragma once

#include "Settings/ModeTable.h"
#include "Settings/PaneTable.h"

#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace orvela {

/// A slider as the command line names it.
struct NamedSlider {
    std::string name;
    const SliderDescription& slider;
};

/// The modes and their sliders as the command line names them.
namespace ModeNames {

/// Every mode that can be chosen by name, in the order of their numbers.
std::vector<const ModeDescription*> selectable();

/// One word that names the mode and no other: the preset identifier, or the display name without blanks.
std::string identifierOf(const ModeDescription& mode);

/// Every mode that has presets of its own.
std::vector<const ModeDescription*> withPresets();

/// The mode of `modes` with that display name or identifier. Case, blanks and punctuation do not matter; of
/// two modes with one display name the first is meant. Null when there is none.
const ModeDescription* find(std::string_view name,
                            const std::vector<const ModeDescription*>& modes = selectable());

/// The identifiers of the modes that can be chosen.
std::vector<std::string> identifiers();

/// The sliders that the mode itself has, by their options: "--value" of a single one, or "--" and the label.
std::vector<NamedSlider> slidersOf(EGUIMode mode);

/// The colours that --colour picks for the mode: those of its own pane.
std::span<const PaneColor> colorsOf(EGUIMode mode);

/// Every slider of the main stage by the setting that --set takes: the name of its position, or of its switch
/// where it has no position.
std::vector<NamedSlider> settings();

/// What the rows of a list are called.
template <typename List>
std::vector<std::string> namesOf(const List& named) {
    std::vector<std::string> names;
    for (const auto& each : named)
        names.emplace_back(each.name);
    return names;
}

/// The sliders of the final touch, such as "AbsContrast".
std::vector<NamedSlider> finalTouchSliders();

} // namespace ModeNames

} // namespace orvela
