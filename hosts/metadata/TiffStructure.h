#pragma once

#include "metadata/Bytes.h"

namespace orvela {

namespace tiff {
enum Type : std::uint16_t {
    Byte = 1,
    Ascii = 2,
    Short = 3,
    Long = 4,
    RationalType = 5,
    Undefined = 7,
    SLong = 9,
    Ifd = 13,
    Long8 = 16,
    SLong8 = 17,
    Ifd8 = 18
};
enum Tag : std::uint16_t {
    ImageWidth = 0x0100,
    ImageLength = 0x0101,
    ImageDescription = 0x010E,
    StripOffsets = 0x0111,
    Orientation = 0x0112,
    XResolution = 0x011A,
    YResolution = 0x011B,
    ResolutionUnit = 0x0128,
    Software = 0x0131,
    Artist = 0x013B,
    TileOffsets = 0x0144,
    SubIfds = 0x014A,
    JpegOffset = 0x0201,
    JpegLength = 0x0202,
    Xmp = 0x02BC,
    Copyright = 0x8298,
    Iptc = 0x83BB,
    Resources = 0x8649,
    ExifIfd = 0x8769,
    IccProfile = 0x8773,
    GpsIfd = 0x8825,
    Layers = 0x935C,
    MakerNote = 0x927C,
    PixelXDimension = 0xA002,
    PixelYDimension = 0xA003,
    InteropIfd = 0xA005,
};
} // namespace tiff

/// One tag of a directory and where its parts stand.
struct TagEntry {
    std::uint16_t tag = 0;
    std::uint16_t type = 0;
    std::uint64_t count = 0;
    std::size_t place = 0;   ///< of the entry
    std::size_t valueAt = 0; ///< of the value: within the entry or elsewhere
    ByteView value;          ///< in the file's byte order; empty when it is damaged or of an unknown type
};

struct TagDirectory {
    std::size_t place = 0;
    std::size_t size = 0; ///< in bytes, with the link
    std::vector<TagEntry> entries;
    std::size_t linkAt = 0; ///< where the place of the next directory stands
    std::size_t next = 0;   ///< 0 for the last one

    /// Null when the tag is not there.
    const TagEntry* find(std::uint16_t tag) const;
};

struct TagChain {
    std::vector<TagDirectory> list;
    bool complete = true; ///< false when one does not fit into the file or they run in a circle
};

/// Bytes of one value; 0 for types that are unknown.
std::size_t tagTypeSize(std::uint16_t type);

/// Of a type of eight bytes that only a BigTIFF knows the one of four, of others the same.
std::uint16_t narrowTagType(std::uint16_t type);

/// Whether the tag leads to one of Exif's directories.
bool leadsToExif(std::uint16_t tag);

/// A TIFF, classic or BigTIFF, of either byte order, or an Exif block. Refers to the bytes.
class TiffView {
public:
    /// @throws DamagedBytes for anything else
    explicit TiffView(ByteView bytes);

    ByteView bytes() const { return mBytes; }
    ByteOrder order() const { return mOrder; }
    bool isBig() const { return mBig; }
    std::size_t offsetSize() const { return mBig ? 8 : 4; }
    std::size_t entrySize() const { return mBig ? 20 : 12; }
    std::size_t headerSize() const { return mBig ? 16 : 8; }
    /// Where the place of the first directory stands.
    std::size_t linkAt() const { return mBig ? 8 : 4; }
    std::size_t first() const { return offset(linkAt()); }

    /// @throws DamagedBytes when it does not fit into the file
    TagDirectory directory(std::size_t place) const;

    /// The first directory and those that it links to, at most `limit`, as far as they can be followed.
    TagChain chain(std::size_t limit) const;

    std::size_t offset(std::size_t at) const { return number(mBytes, at, offsetSize(), mOrder); }

    /// One of the whole numbers of an entry. @throws DamagedBytes when it has none there
    std::uint64_t value(const TagEntry& entry, std::size_t index = 0) const;

private:
    TagEntry entry(std::size_t place) const;

    ByteView mBytes;
    ByteOrder mOrder = ByteOrder::Little;
    bool mBig = false;
};

/// Tags that tell how a TIFF stores its samples, or whose content has a place of its own: XMP, IPTC,
/// Photoshop's resources and layers, the ICC profile, further directories. They do not describe the picture.
bool isTiffStructure(std::uint16_t tag);

} // namespace orvela
