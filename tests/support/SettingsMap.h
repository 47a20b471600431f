#pragma once

#include "Settings/CSliderParams.h"

#include <map>
#include <string>

namespace orvela {

/// The settings that are not 0 or off, by name.
inline std::map<std::string, double> settingsOf(const CSliderParams& sliders) {
    std::map<std::string, double> settings;
    for (const SliderField& field : sliderFields()) {
        const double value = field.flag ? double(sliders.*field.flag) : double(sliders.*field.value);
        if (value != 0)
            settings[field.name] = value;
    }
    return settings;
}

/// Every switch on, every position and part of a colour another whole number, from 1 on.
inline CSliderParams distinctSettings() {
    CSliderParams sliders;
    float position = 0;
    for (const SliderField& field : sliderFields())
        field.flag ? void(sliders.*field.flag = true) : void(sliders.*field.value = ++position);
    return sliders;
}

} // namespace orvela
