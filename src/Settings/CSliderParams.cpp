#include "Settings/CSliderParams.h"

namespace orvela {

namespace {

constexpr SliderField makeField(const char* name, float CSliderParams::*value, int listed) {
    return {name, value, nullptr, listed};
}
constexpr SliderField makeField(const char* name, bool CSliderParams::*flag, int listed) {
    return {name, nullptr, flag, listed};
}

constexpr SliderField kSliderFields[] = {
#define ORVELA_SLIDER_FIELD(type, name, listed) makeField(#name, &CSliderParams::name, listed),
#include "Settings/SliderFields.inc"
};

} // namespace

std::span<const SliderField> sliderFields() {
    return kSliderFields;
}

} // namespace orvela
