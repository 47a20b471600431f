#pragma once

#include "metadata/Bytes.h"

namespace orvela {

/// A tag with its value in the byte order of the block that it goes into.
struct TagField {
    std::uint16_t tag = 0;
    std::uint16_t type = 0;
    std::uint32_t count = 0;
    Bytes value;
};

} // namespace orvela
