#pragma once

#include "files/TargetFile.h"
#include "files/TiffStorage.h"

namespace orvela {

/// Writes a TIFF page by page into a target file: the samples of each page at once, all directories at the
/// end, when it is known whether the file became so large that it has to be a BigTIFF.
class TiffWriter {
public:
    static constexpr std::uint64_t kClassicLimit = 0xFFFFFFFF;

    /// @param file   an empty one
    /// @param front  what the file begins with, from its byte order mark on: an Exif block or parts of
    ///               another TIFF; empty for nothing. A field whose value stands there at its offset is not
    ///               written again, so that maker notes stay where they were.
    /// @param stop   ends the writing when it is set; may be null
    /// @param classicLimit  the largest offset of a file that is no BigTIFF
    /// @throws TargetError, StoppedError
    TiffWriter(TargetFile& file, ByteOrder order, Bytes front, const std::atomic<bool>* stop,
               std::uint64_t classicLimit = kClassicLimit);

    /// Adds a picture, with those of the fields that its storage does not give.
    /// @throws TargetError, StoppedError; TiffError when it cannot be encoded
    void addPicture(const Photograph& photograph, const TiffStorage& storage,
                    const std::vector<TiffField>& fields);

    /// Adds a page as it stands in another TIFF of the same byte order: its strips or tiles, and fields of
    /// it.
    /// @throws TargetError, StoppedError
    void addCopy(const std::vector<Bytes>& blocks, std::vector<TiffField> fields);

    /// Writes the directories. @throws TargetError, StoppedError
    void finish();

private:
    /// A field of which a long value stands in the file already.
    struct Entry {
        std::uint16_t tag;
        std::uint16_t type;
        std::uint64_t count;
        Bytes value; ///< empty when it stands at `offset`
        std::uint64_t offset;
        std::vector<Entry> below;
    };
    using Directory = std::vector<Entry>; ///< by ascending tags

    void append(ByteView bytes);
    Directory place(const std::vector<TiffField>& fields);
    Entry place(const TiffField& field);
    bool isInFront(const TiffField& field) const;
    bool needsLarge() const;
    std::uint64_t write(const Directory& directory, bool large);
    static std::size_t offsetSize(bool large) { return large ? 8 : 4; }
    Bytes packed(const Entry& entry, bool large);

    TargetFile& mFile;
    ByteOrder mOrder;
    Bytes mFront;
    const std::atomic<bool>* mStop;
    std::uint64_t mClassicLimit;
    std::vector<Directory> mPages;
};

} // namespace orvela
