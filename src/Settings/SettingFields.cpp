#include "Settings/SettingFields.h"

#include "Settings/SliderTable.h"

#include <algorithm>

namespace orvela {

namespace SettingFields {

const SliderField* find(std::string_view name) {
    const auto fields = sliderFields();
    const auto found = std::find_if(fields.begin(), fields.end(),
                                    [name](const SliderField& each) { return each.name == name; });
    return found == fields.end() ? nullptr : &*found;
}

float highest(const SliderField& field) {
    using P = CSliderParams;
    static constexpr float P::*kColors[] = {&P::mColor_Value_R,       &P::mColor_Value_G,
                                            &P::mColor_Value_B,       &P::mColor_Touch_Value_R,
                                            &P::mColor_Touch_Value_G, &P::mColor_Touch_Value_B};
    return std::find(std::begin(kColors), std::end(kColors), field.value) == std::end(kColors) ? 1000.0F
                                                                                               : 255.0F;
}

bool CSliderParams::*switchOf(const SliderField& field) {
    for (const auto sliders : {SliderTable::advanced(), SliderTable::finalTouch()})
        for (const SliderDescription& slider : sliders)
            if (field.value && slider.value == field.value)
                return slider.enabled;
    return nullptr;
}

bool isFinalTouch(const SliderField& field) {
    return std::string_view(field.name).find("_Touch_") != std::string_view::npos;
}

bool anyFinalTouchOn(const CSliderParams& sliders) {
    const auto slidersOfStage = SliderTable::finalTouch();
    return std::any_of(slidersOfStage.begin(), slidersOfStage.end(), [&](const SliderDescription& slider) {
        return slider.enabled && sliders.*slider.enabled;
    });
}

CSliderParams onlyFinalTouch(const CSliderParams& sliders, bool finalTouch) {
    CSliderParams kept;
    for (const SliderField& field : sliderFields()) {
        if (isFinalTouch(field) != finalTouch)
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
