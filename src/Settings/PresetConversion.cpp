#include "Settings/PresetConversion.h"

#include "Settings/PaneTable.h"

#include <algorithm>

namespace orvela {

namespace {

template <typename Entry>
const Entry* find(const QList<Entry>& entries, const char* object) {
    const auto found = std::find_if(entries.begin(), entries.end(), [object](const Entry& entry) {
        return entry.object == QLatin1String(object);
    });
    return found == entries.end() ? nullptr : &*found;
}

double positionOf(const SliderDescription& slider, const CSliderParams& sliders) {
    return slider.value ? static_cast<double>(sliders.*slider.value) : 0;
}

} // namespace

namespace PresetConversion {

bool hasControls(EGUIMode mode) {
    return !PaneTable::sliders(mode).empty();
}

PresetContent contentOf(EGUIMode mode, const CSliderParams& sliders) {
    PresetContent content;
    for (const PaneSlider& each : PaneTable::sliders(mode))
        if (!each.mirror)
            content.sliders.append({QString::fromLatin1(each.object), positionOf(each.slider, sliders),
                                    sliders.*each.slider.enabled});
    for (const auto& [object, color] : PaneTable::colors(mode)) {
        const auto& [red, green, blue] = color.parts;
        content.colors.append({QString::fromLatin1(object), static_cast<int>(sliders.*red),
                               static_cast<int>(sliders.*green), static_cast<int>(sliders.*blue)});
    }
    return content;
}

CSliderParams paramsOf(EGUIMode mode, const PresetContent& content) {
    CSliderParams sliders;
    for (const PaneSlider& each : PaneTable::sliders(mode)) {
        const PresetSlider* stored = each.mirror ? nullptr : find(content.sliders, each.object);
        if (!stored)
            continue;
        if (each.slider.value)
            sliders.*each.slider.value = static_cast<float>(std::clamp(stored->value, 0.0, 1000.0));
        sliders.*each.slider.enabled = stored->enabled;
    }
    for (const auto& [object, color] : PaneTable::colors(mode)) {
        const PresetColor* stored = find(content.colors, object);
        if (!stored)
            continue;
        const auto& [red, green, blue] = color.parts;
        sliders.*red = static_cast<float>(stored->red);
        sliders.*green = static_cast<float>(stored->green);
        sliders.*blue = static_cast<float>(stored->blue);
    }
    return sliders;
}

} // namespace PresetConversion

} // namespace orvela
