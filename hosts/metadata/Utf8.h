#pragma once

#include "metadata/Bytes.h"

#include <string>

namespace orvela {

/// Text of ISO 8859-1 in UTF-8.
std::string latinToUtf8(ByteView latin);

/// The bytes as they stand if they are UTF-8, otherwise taken for ISO 8859-1.
std::string toUtf8(const std::string& bytes);

} // namespace orvela
