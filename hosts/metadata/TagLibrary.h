#pragma once

#include "metadata/Bytes.h"

#include <string>

// What only a library knows that understands the tags.

namespace orvela {

/// An Exif block that the library laid out anew.
struct RewrittenExif {
    Bytes block;
    std::vector<std::string> lost; ///< names of the tags that vanished or changed
};

/// The tags of a TIFF's first page that describe the picture, as a block in the file's byte order.
/// @throws DamagedBytes when the library cannot read it
RewrittenExif rewriteTiffExif(ByteView file);

bool isWellFormedXmp(ByteView packet);

/// "Keywords", "City", ...: each kind of an IPTC block once, without what tells of the block itself.
std::vector<std::string> iptcNames(ByteView iptc);

} // namespace orvela
