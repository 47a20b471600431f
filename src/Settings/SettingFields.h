#pragma once

#include "Settings/CSliderParams.h"

#include <string_view>

namespace orvela {

/// What the outside may know of the fields of CSliderParams: their names, ranges and switches.
namespace SettingFields {

/// The field of that exact name; null when there is none.
const SliderField* find(std::string_view name);

/// Largest value of a value field: 255 for a picker colour, 1000 for a position. The smallest is 0.
float highest(const SliderField& field);

/// The switch that turns the slider of a value field on; null for picker colours and flags.
bool CSliderParams::*switchOf(const SliderField& field);

/// True for the fields that the final-touch stage reads.
bool isFinalTouch(const SliderField& field);

/// True when a slider of the final-touch stage is on.
bool anyFinalTouchOn(const CSliderParams& sliders);

/// `sliders` with only the fields of the final-touch stage (or only the others) kept, the rest 0 and off.
CSliderParams onlyFinalTouch(const CSliderParams& sliders, bool finalTouch);

} // namespace SettingFields

} // namespace orvela
