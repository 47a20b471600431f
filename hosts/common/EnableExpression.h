#pragma once

#include "Platform/FilterRecord.h"

#include <string_view>

namespace orvela {

/// Whether a filter with this enable expression is offered for images of a mode. Expressions have the form
/// "in (PSHOP_ImageMode, RGBMode, CMYKMode)", with the modes of the interface's documentation; an empty one
/// offers it always.
/// @throws ModuleError, without the file's name, for any other form or an unknown name
bool isEnabledFor(std::string_view expression, host::ImageMode mode);

} // namespace orvela
