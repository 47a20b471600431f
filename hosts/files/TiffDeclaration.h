#pragma once

#include "files/DeclaredPicture.h"
#include "files/TiffFile.h"

namespace orvela {

/// What a page says of its picture.
/// @throws PhotographError when no picture can have such samples, or one whose kind cannot be read
DeclaredPicture declaredPicture(const TiffFile& tiff, const TiffPage& page, int index,
                                std::uint64_t fileBytes);

} // namespace orvela
