#pragma once

#include "metadata/JpegSegments.h"
#include "metadata/Metadata.h"
#include "metadata/TagField.h"
#include "metadata/TiffStructure.h"

#include <functional>
#include <utility>

namespace orvela {

/// Makes a JPEG of that many pixels that shows the photograph; empty when it cannot.
using ThumbnailMaker = std::function<Bytes(int width, int height, int quality)>;

/// One of that size in so many bytes, in the best quality that fits; empty when none does.
/// @param turned  swaps the edges
Bytes thumbnailWithin(const ThumbnailMaker& make, const JpegSize& size, bool turned, std::size_t most);

/// An Exif block that is edited in place: whatever is not asked for keeps its bytes and its distance from the
/// beginning, so that the offsets in maker notes stay true. Of a damaged block the parts that cannot be
/// followed stay as they are.
class ExifBlock {
public:
    /// @param block  from the byte order mark on; may be empty
    explicit ExifBlock(Bytes block);

    /// Whether a directory could not be followed.
    bool isDamaged() const { return mDamaged; }
    const Bytes& bytes() const { return mBytes; }

    /// Gives the tags that state the picture's edges these values.
    void setDimensions(int width, int height);

    /// How the picture has to be turned, 1 to 8; 1, as it stands, where nothing or nothing known is said.
    int orientation() const;

    /// Turns every orientation to "as it stands".
    void makeUpright();

    /// What the resolution tags state; none when they are not all there.
    std::optional<Density> density() const;

    /// States the density in the resolution tags.
    /// @return false for a damaged block, which stays as it is
    bool setDensity(const Density& density);

    /// Makes every thumbnail anew, in the pixel size and the place of the old one; one whose place is too
    /// small even in low quality, or that is no JPEG, is dropped.
    /// @param turned  swaps the edges: the picture has been turned since
    /// @return whether all could be made
    bool renewThumbnails(const ThumbnailMaker& make, bool turned);

    /// Unlinks the directories of the thumbnails and clears their pictures; the block ends before one that
    /// stood last. @return whether there was any
    bool dropThumbnails();

    /// The text of a tag of the first directory; none when it is not there.
    std::optional<std::string> text(std::uint16_t tag) const;

    /// Adds tags, which are not there yet, to the first directory; it moves to the block's end. An empty
    /// block becomes one.
    void add(const std::vector<TagField>& fields);

    ByteOrder order() const { return mOrder; }

private:
    struct Thumbnail;

    template <typename Edit>
    void forEach(std::uint16_t tag, Edit edit) const;
    void patch(const TagEntry& entry, std::uint64_t value);
    std::vector<Thumbnail> thumbnails() const;
    bool renew(const Thumbnail& thumbnail, const ThumbnailMaker& make, bool turned);
    void drop(const Thumbnail& thumbnail);
    bool isShared(const Thumbnail& thumbnail) const;

    Bytes mBytes;
    ByteOrder mOrder = ByteOrder::Little;
    bool mDamaged = false;
};

/// The first directory of a page and those below it, each with the tag that leads there: 0, Exif, GPS,
/// Interoperability.
struct ExifDirectories {
    std::vector<std::pair<std::uint16_t, TagDirectory>> list;
    bool complete = true; ///< false when one does not fit or was met before

    /// Null when it is not there.
    const TagDirectory* find(std::uint16_t pointer) const;
};
ExifDirectories exifDirectories(const TiffView& view, std::size_t first);

} // namespace orvela
