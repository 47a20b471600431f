#include "Settings/SettingFields.h"

#include <algorithm>

namespace orvela {

namespace {

// The first of `entries` that holds; null when none does.
template <typename Entry, typename Holds>
const Entry* firstOf(std::span<const Entry> entries, Holds holds) {
    const auto found = std::find_if(entries.begin(), entries.end(), holds);
    return found == entries.end() ? nullptr : &*found;
}

const ColorDescription* colorOf(const SliderField& field) {
    return firstOf(SliderTable::colors(), [&field](const ColorDescription& each) {
        return std::find(each.parts.begin(), each.parts.end(), field.value) != each.parts.end();
    });
}

} // namespace

namespace SettingFields {

const SliderField* find(std::string_view name) {
    return firstOf(sliderFields(), [name](const SliderField& each) { return each.name == name; });
}

float highest(const SliderField& field) {
    return colorOf(field) ? 255.0F : 1000.0F;
}

const SliderDescription* sliderOf(const SliderField& field) {
    return firstOf(SliderTable::sliders(), [&field](const SliderDescription& each) {
        return field.value ? each.value == field.value : each.enabled == field.flag;
    });
}

bool CSliderParams::*switchOf(const SliderField& field) {
    const SliderDescription* slider = field.value ? sliderOf(field) : nullptr;
    return slider ? slider->enabled : nullptr;
}

SettingStage stageOf(const SliderField& field) {
    if (const SliderDescription* slider = sliderOf(field))
        return slider->stage;
    const ColorDescription* color = colorOf(field);
    return color ? color->stage : SettingStage::Main;
}

bool anyOn(const CSliderParams& sliders, SettingStage stage) {
    const auto isOn = [&](const SliderDescription& slider) {
        return slider.stage == stage && sliders.*slider.enabled;
    };
    return firstOf(SliderTable::sliders(), isOn) != nullptr;
}

CSliderParams ofStage(const CSliderParams& sliders, SettingStage stage) {
    CSliderParams kept;
    for (const SliderField& field : sliderFields()) {
        if (stageOf(field) != stage)
            continue;
        if (field.value)
            kept.*field.value = sliders.*field.value;
        else
            kept.*field.flag = sliders.*field.flag;
    }
    return kept;
}

} // namespace SettingFields

} // namespace orvela
