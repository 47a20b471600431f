#pragma once

#include "metadata/Bytes.h"

namespace orvela {

/// What became of the thumbnails in an XMP packet.
enum class ThumbnailsOfXmp { None, Taken, Kept };

/// Takes the elements out of a packet that show the picture as it was. Where no well-formed packet would
/// remain, all is kept.
ThumbnailsOfXmp takeThumbnails(Bytes& packet);

} // namespace orvela
