#pragma once

#include <span>

/// Every slider position (0 to 1000), switch and picker colour (0 to 255) of a run.
struct CSliderParams {
#define ORVELA_SLIDER_FIELD(type, name, listed) type name = {};
#include "Settings/SliderFields.inc"
};

namespace orvela {

/// One field of CSliderParams by name; exactly one of the member pointers is set.
struct SliderField {
    const char* name;
    float CSliderParams::*value;
    bool CSliderParams::*flag;
    int listed; ///< position among the lines of the listing, 0 when it has none
};

/// All fields of CSliderParams, in order.
std::span<const SliderField> sliderFields();

} // namespace orvela
