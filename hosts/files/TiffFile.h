#pragma once

#include "files/SourceFile.h"
#include "files/TiffPage.h"
#include "files/TiffPageStream.h"

#include <limits>

namespace orvela {

/// The pages of a TIFF file, read one by one.
class TiffFile {
public:
    static constexpr int kAll = std::numeric_limits<int>::max();

    /// Follows the chain of the pages, as far as it is wanted.
    /// @throws PhotographError when it leads out of the file or back to an earlier page
    explicit TiffFile(SourceFile& file, int wanted = kAll);

    int pages() const { return static_cast<int>(mPlaces.size()); }

    /// Whether what it shows is a preview only; see CameraRaw.h.
    bool isCameraRaw() const;

    /// Whether there are pages that were not wanted.
    bool hasMore() const { return mHasMore; }

    /// Where the directory of a page stands, counted from 0.
    std::size_t place(int index) const { return mPlaces.at(static_cast<std::size_t>(index)); }

    /// What the directory of a page says.
    /// @throws PhotographError when it is damaged
    TiffPage page(int index) const;

    /// True for a transparency mask, which is no picture.
    static bool isMask(const TiffPage& page);

    /// The strips or tiles as they stand, at most as many as wanted.
    /// @throws PhotographError when the file does not hold them
    std::vector<Bytes> readBlocks(const TiffPage& page, int index, std::size_t wanted = SIZE_MAX) const;

    /// The file with this page alone, for libraries that look for a page along all before it.
    TiffPageStream alone(int index) const;

    /// Decodes a page of samples that libtiff alone knows to turn into RGB, as rows of 8-bit RGB.
    /// @throws PhotographError
    Bytes readRgb(int index) const;

    /// How messages name a page: the file, and which page when it has several.
    std::filesystem::path pageName(int index) const;

private:
    bool follow(const TiffView& tiff, std::size_t at, int wanted);
    TagDirectory directory(const TiffView& tiff, int index) const;
    [[noreturn]] void refusePage(int index, const std::string& cause) const;

    SourceFile& mFile;
    std::vector<std::size_t> mPlaces; ///< of the directories
    bool mHasMore = false;
};

} // namespace orvela
