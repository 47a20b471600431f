#pragma once

#include "Settings/SliderTable.h"

#include <string_view>

namespace orvela {

/// What the outside may know of the fields of CSliderParams: their names, ranges, switches and stages, all by
/// the sliders and colours that drive them.
namespace SettingFields {

/// The field of that exact name; null when there is none.
const SliderField* find(std::string_view name);

/// Largest value of a value field: 255 for a part of a colour, 1000 for a position. The smallest is 0.
float highest(const SliderField& field);

/// The slider whose position the field holds, or whose switch it is; null for any other field.
const SliderDescription* sliderOf(const SliderField& field);

/// The switch that turns the slider of a value field on; null for parts of colours and flags.
bool CSliderParams::*switchOf(const SliderField& field);

/// The stage that reads the field. The fields that nothing drives and nothing reads count to the main one.
SettingStage stageOf(const SliderField& field);

/// True when a slider of the stage is on.
bool anyOn(const CSliderParams& sliders, SettingStage stage);

/// `sliders` with only the fields of the stage kept, the rest 0 and off.
CSliderParams ofStage(const CSliderParams& sliders, SettingStage stage);

} // namespace SettingFields

} // namespace orvela
