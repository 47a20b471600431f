#pragma once

#include "metadata/ExifBlock.h"

namespace orvela {

namespace resource {
enum Id : std::uint16_t {
    ResolutionInfo = 0x03ED,
    Iptc = 0x0404,
    ThumbnailBgr = 0x0409,
    Thumbnail = 0x040C,
    IccProfile = 0x040F,
    Exif = 0x0422,
    Exif3 = 0x0423,
    VersionInfo = 0x0421,
    Xmp = 0x0424,
};
} // namespace resource

/// One of Photoshop's image resources.
struct ImageResource {
    std::uint16_t id = 0;
    ByteView data;
    ByteView whole; ///< with its head and its padding
};

/// The resources of a list, as far as they are whole.
struct ImageResources {
    std::vector<ImageResource> list;
    ByteView rest; ///< behind the last one that is whole: empty unless the list is damaged

    /// Null when it is not there.
    const ImageResource* find(std::uint16_t id) const;
};
ImageResources imageResources(ByteView list);

/// The list without the resources of these ids.
Bytes withoutResources(ByteView list, const std::vector<std::uint16_t>& ids);

void appendResource(Bytes& list, std::uint16_t id, ByteView data);

/// Adds the resources of another list that are not there with the same data. Damaged lists come whole.
void addResources(Bytes& list, ByteView more);

/// Whether the lists hold the same, in any order. Zeros behind the IPTC records are not looked at.
bool sameResources(ByteView a, ByteView b);

/// The pixels per inch that the resolution resource states.
std::optional<Density> resourceDensity(ByteView list);

/// Makes the thumbnail anew in the pixel size that it has, or drops it where that cannot be done.
/// @return whether it could be done, or there was none
bool renewResourceThumbnail(Bytes& list, const ThumbnailMaker& make);

} // namespace orvela
