#pragma once

#include "metadata/Metadata.h"
#include "metadata/TagField.h"
#include "metadata/TiffStructure.h"

namespace orvela {

/// What the resolution tags of a directory state; none when they are not all there or state nothing.
std::optional<Density> densityOf(const TiffView& view, const TagDirectory& directory);

/// The resolution tags that state the density.
std::vector<TagField> densityFields(const Density& density, ByteOrder order);

} // namespace orvela
