#include "command/ModesCommand.h"

#include "run/ModeNames.h"
#include "run/TextValues.h"

#include <algorithm>
#include <iostream>
#include <nlohmann/json.hpp>

namespace orvela {

namespace {

double lowest(const SliderDescription& slider) {
    return std::min(slider.scale->low(), slider.scale->high());
}

double highest(const SliderDescription& slider) {
    return std::max(slider.scale->low(), slider.scale->high());
}

void print(const std::string& heading, const char* help) {
    std::cout << "      " << heading << "\n          " << help << '\n';
}

std::string range(double from, double to) {
    return TextValues::shortest(from) + " to " + TextValues::shortest(to);
}

void print(const std::vector<NamedSlider>& sliders) {
    for (const auto& [name, slider] : sliders)
        print(name + "  " + slider.label + ", " + range(lowest(slider), highest(slider)), slider.help);
}

void printSettings() {
    for (const auto& [name, slider] : ModeNames::settings()) {
        std::string heading = name + "=on";
        if (slider.value)
            heading = name + "=POSITION,on  " + slider.label + ", " +
                      range(slider.scale->low(), slider.scale->high());
        print(heading, slider.help);
    }
}

nlohmann::ordered_json describeSettings() {
    auto list = nlohmann::ordered_json::array();
    for (const auto& [name, slider] : ModeNames::settings()) {
        auto& row = list.emplace_back(nlohmann::ordered_json{{"name", name}, {"label", slider.label}});
        if (slider.value)
            row.update({{"shownAt0", slider.scale->low()}, {"shownAt1000", slider.scale->high()}});
        row["help"] = slider.help;
    }
    return list;
}

nlohmann::ordered_json describeColors(EGUIMode mode) {
    auto list = nlohmann::ordered_json::array();
    for (const PaneColor& each : ModeNames::colorsOf(mode))
        list.push_back({{"option", "--colour"}, {"help", each.color.help}});
    return list;
}

nlohmann::ordered_json describe(const std::vector<NamedSlider>& sliders) {
    auto list = nlohmann::ordered_json::array();
    for (const auto& [name, slider] : sliders)
        list.push_back({{"option", name},
                        {"label", slider.label},
                        {"low", lowest(slider)},
                        {"high", highest(slider)},
                        {"help", slider.help}});
    return list;
}

void listText() {
    for (const ModeDescription* mode : ModeNames::selectable()) {
        std::cout << ModeNames::identifierOf(*mode) << ": " << mode->summary << '\n';
        print(ModeNames::slidersOf(mode->mode));
        for (const PaneColor& each : ModeNames::colorsOf(mode->mode))
            print("--colour  R,G,B, 0 to 255 each", each.color.help);
    }
    std::cout
        << "\nEvery setting, for any mode (--set; positions from 0, the first number, to 1000, the last):\n";
    printSettings();
    std::cout << "\nFinal touch, after any mode (--final-touch NAME=NUMBER,...):\n";
    print(ModeNames::finalTouchSliders());
}

void listJson() {
    auto modes = nlohmann::ordered_json::array();
    for (const ModeDescription* mode : ModeNames::selectable())
        modes.push_back({{"number", static_cast<int>(mode->mode)},
                         {"identifier", ModeNames::identifierOf(*mode)},
                         {"name", mode->displayName},
                         {"summary", mode->summary},
                         {"sliders", describe(ModeNames::slidersOf(mode->mode))},
                         {"colours", describeColors(mode->mode)}});
    const nlohmann::ordered_json list = {{"modes", modes},
                                         {"settings", describeSettings()},
                                         {"finalTouch", describe(ModeNames::finalTouchSliders())}};
    std::cout << list.dump(2) << '\n';
}

} // namespace

ExitStatus listModes(bool asJson) {
    asJson ? listJson() : listText();
    return ExitStatus::Done;
}

std::vector<std::string> nameKinds() {
    return {"modes", "settings", "final-touch"};
}

ExitStatus listNames(const std::string& kind) {
    const std::vector<std::string> names = kind == "settings" ? ModeNames::namesOf(ModeNames::settings())
                                           : kind == "final-touch"
                                               ? ModeNames::namesOf(ModeNames::finalTouchSliders())
                                               : ModeNames::identifiers();
    for (const std::string& name : names)
        std::cout << name << '\n';
    return ExitStatus::Done;
}

} // namespace orvela
