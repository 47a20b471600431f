#pragma once

#include "files/DeclaredPicture.h"
#include "files/Photograph.h"

#include <vector>

namespace orvela {

class SourceFile;
class TiffFile;

struct ReadOptions {
    bool firstOnly = false; ///< of an animation or a file of several pages the first picture
    ReadLimits limits = {}; ///< of each picture
};

/// Reads a JPEG, PNG, TIFF, WebP, PSD or HEIF file, recognised by its content, page by page: 8 or 16 bits;
/// grey, grey with transparency, RGB, RGB with transparency, CMYK. Palettes and TIFF's YCbCr become RGB,
/// bitmaps 8-bit grey, HEIF of 10 and 12 bits 16 bits. The orientation tag is not applied to the pixels,
/// except by HEIF decoding, which always turns them upright. Every directory in the chain of a TIFF is a
/// page; of a PSD the merged picture is read, of a HEIF the primary one.
class PhotographReader {
public:
    /// @throws PhotographError when the file is missing, a folder, empty, unreadable, no picture, a camera's
    /// raw file, an animation (unless asked for its first picture), or a TIFF with a damaged chain of pages
    explicit PhotographReader(const std::filesystem::path& path, const ReadOptions& options = {});
    ~PhotographReader();
    PhotographReader(const PhotographReader&) = delete;
    PhotographReader& operator=(const PhotographReader&) = delete;

    int pages() const { return mPages; }

    /// The next page: at first the first one, at most pages() of them.
    /// @throws PhotographError when it is cut short, above the limits, or a picture that the filter cannot
    ///         take: over 32767 pixels wide or high, more than four channels, floating point samples, Lab and
    ///         other colour models
    /// @throws MemoryError, std::bad_alloc when the memory does not suffice
    Photograph next();

private:
    Photograph readOther();

    ReadOptions mOptions;
    std::unique_ptr<SourceFile> mFile;
    std::unique_ptr<TiffFile> mTiff; ///< null for other files
    FileFormat mFormat = FileFormat::Png;
    int mPages = 1;
    int mNext = 0;
};

/// The first page of a file; see PhotographReader.
Photograph readPhotograph(const std::filesystem::path& path, const ReadOptions& options = {});

} // namespace orvela
