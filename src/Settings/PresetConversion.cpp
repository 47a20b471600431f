#include "Settings/PresetConversion.h"

#include "Settings/SliderTable.h"

#include <algorithm>

namespace orvela {

namespace {

using P = CSliderParams;

// The fields of a pane's colour picker; object is null for a pane without one.
struct Picker {
    const char* object = nullptr;
    float P::*red = nullptr;
    float P::*green = nullptr;
    float P::*blue = nullptr;
};

Picker pickerOf(EGUIMode mode) {
    if (mode == Mode_FinalTouch)
        return {"colrPickAbsColorFilter", &P::mColor_Touch_Value_R, &P::mColor_Touch_Value_G,
                &P::mColor_Touch_Value_B};
    if (mode == Mode_Advanced)
        return {"colrPickAutoColor", &P::mColor_Value_R, &P::mColor_Value_G, &P::mColor_Value_B};
    if (mode == Mode_ColorFilter)
        return {"colrPickGeneric", &P::mColor_Value_R, &P::mColor_Value_G, &P::mColor_Value_B};
    return {};
}

std::span<const SliderDescription> slidersOf(EGUIMode mode) {
    if (mode == Mode_Advanced)
        return SliderTable::advanced();
    if (mode == Mode_FinalTouch)
        return SliderTable::finalTouch();
    if (const SliderDescription* slider = SliderTable::single(mode))
        return {slider, 1};
    return SliderTable::threeSliders(mode);
}

bool isMirror(const SliderDescription& slider) {
    return !slider.value && !slider.enabled;
}

template <typename Entry>
const Entry* find(const QList<Entry>& entries, const char* object) {
    const auto found = std::find_if(entries.begin(), entries.end(), [object](const Entry& entry) {
        return entry.object == QLatin1String(object);
    });
    return found == entries.end() ? nullptr : &*found;
}

} // namespace

namespace PresetConversion {

bool hasControls(EGUIMode mode) {
    return !slidersOf(mode).empty();
}

PresetContent contentOf(EGUIMode mode, const CSliderParams& sliders) {
    PresetContent content;
    for (const SliderDescription& slider : slidersOf(mode))
        if (!isMirror(slider))
            content.sliders.append({QString::fromLatin1(slider.object),
                                    slider.value ? static_cast<double>(sliders.*slider.value) : 0,
                                    slider.enabled && sliders.*slider.enabled});
    if (const Picker picker = pickerOf(mode); picker.object)
        content.colors.append({QString::fromLatin1(picker.object), static_cast<int>(sliders.*picker.red),
                               static_cast<int>(sliders.*picker.green),
                               static_cast<int>(sliders.*picker.blue)});
    return content;
}

CSliderParams paramsOf(EGUIMode mode, const PresetContent& content) {
    CSliderParams sliders;
    for (const SliderDescription& slider : slidersOf(mode)) {
        const PresetSlider* stored = find(content.sliders, slider.object);
        if (stored && slider.value)
            sliders.*slider.value = static_cast<float>(std::clamp(stored->value, 0.0, 1000.0));
        if (stored && slider.enabled)
            sliders.*slider.enabled = stored->enabled;
    }
    const Picker picker = pickerOf(mode);
    if (const PresetColor* stored = picker.object ? find(content.colors, picker.object) : nullptr) {
        sliders.*picker.red = static_cast<float>(stored->red);
        sliders.*picker.green = static_cast<float>(stored->green);
        sliders.*picker.blue = static_cast<float>(stored->blue);
    }
    return sliders;
}

} // namespace PresetConversion

} // namespace orvela
