#include "command/ModesCommand.h"

#include "Settings/SliderTable.h"
#include "command/ModeNames.h"
#include "command/TextValues.h"

#include <algorithm>
#include <cstring>
#include <iostream>
#include <nlohmann/json.hpp>

namespace orvela {

namespace {

// How a slider is set on the command line.
struct NamedSlider {
    std::string option;
    const SliderDescription* slider;
};

std::vector<NamedSlider> slidersOf(EGUIMode mode) {
    std::vector<NamedSlider> sliders;
    if (const SliderDescription* slider = SliderTable::single(mode))
        sliders.push_back({"--value", slider});
    for (const SliderDescription& slider : SliderTable::threeSliders(mode))
        sliders.push_back({"--" + ModeNames::plain(slider.label), &slider});
    return sliders;
}

std::vector<NamedSlider> finalTouchSliders() {
    std::vector<NamedSlider> sliders;
    for (const SliderDescription& slider : SliderTable::finalTouch())
        sliders.push_back({slider.object + std::strlen("sldr"), &slider});
    return sliders;
}

double lowest(const SliderDescription& slider) {
    return std::min(slider.low, slider.high);
}

double highest(const SliderDescription& slider) {
    return std::max(slider.low, slider.high);
}

void printSlider(const NamedSlider& named) {
    std::cout << "      " << named.option << "  " << named.slider->label << ", "
              << TextValues::shortest(lowest(*named.slider)) << " to "
              << TextValues::shortest(highest(*named.slider)) << '\n';
}

nlohmann::ordered_json describe(const std::vector<NamedSlider>& sliders) {
    auto list = nlohmann::ordered_json::array();
    for (const NamedSlider& named : sliders)
        list.push_back({{"option", named.option},
                        {"label", named.slider->label},
                        {"low", lowest(*named.slider)},
                        {"high", highest(*named.slider)}});
    return list;
}

void listText() {
    for (const ModeDescription* mode : ModeNames::selectable()) {
        std::cout << ModeNames::identifierOf(*mode) << ": " << mode->summary << '\n';
        for (const NamedSlider& named : slidersOf(mode->mode))
            printSlider(named);
        if (mode->mode == Mode_ColorFilter)
            std::cout << "      --colour  R,G,B, 0 to 255 each\n";
    }
    std::cout << "\nFinal touch, after any mode (--final-touch NAME=NUMBER,...):\n";
    for (const NamedSlider& named : finalTouchSliders())
        printSlider(named);
}

void listJson() {
    auto modes = nlohmann::ordered_json::array();
    for (const ModeDescription* mode : ModeNames::selectable())
        modes.push_back({{"number", static_cast<int>(mode->mode)},
                         {"identifier", ModeNames::identifierOf(*mode)},
                         {"name", mode->displayName},
                         {"summary", mode->summary},
                         {"sliders", describe(slidersOf(mode->mode))}});
    const nlohmann::ordered_json list = {{"modes", modes}, {"finalTouch", describe(finalTouchSliders())}};
    std::cout << list.dump(2) << '\n';
}

} // namespace

ExitStatus listModes(bool asJson) {
    asJson ? listJson() : listText();
    std::cout.flush();
    return ExitStatus::Done;
}

} // namespace orvela
