#pragma once

#include "files/FileFormat.h"

#include <atomic>
#include <optional>
#include <string>
#include <vector>

namespace orvela {

/// How to write; whatever is not given follows the source where it has the target's format: JPEG by its
/// quantization tables, HEIF by a quality that takes as many bytes per pixel. Otherwise JPEG quality 92, WebP
/// and HEIF 90, full chroma resolution, LZW.
struct WriteOptions {
    bool overwrite = false;                  ///< replace an existing target; never the source itself
    bool keepTime = false;                   ///< the target gets the time stamps of the source
    int quality = 0;                         ///< JPEG, WebP, HEIF: 1 to 100; 0 as the source
    std::optional<bool> chromaSubsampled;    ///< JPEG, HEIF: colour at half resolution both ways, or at full
    std::optional<bool> lossless;            ///< WebP
    std::optional<bool> progressive;         ///< JPEG, PNG
    std::string compression;                 ///< TIFF: "none", "lzw", "deflate", "packbits", "zstd" or "jpeg"
    const std::atomic<bool>* stop = nullptr; ///< set it, also in a signal handler, to end the writing
};

/// The format that a target's name asks for.
/// @throws PhotographError for an extension of no format, and for formats that are read only
FileFormat writtenFormat(const std::filesystem::path& target);

/// Whether writing the photograph there can succeed, as far as can be told without writing: the format can
/// hold it, the target is not its source, not a folder and does not exist (unless it may be overwritten), and
/// its folder exists and may be written to, and the memory suffices to encode it.
/// @throws PhotographError when the format is unknown or cannot hold the picture
/// @throws MemoryError when the memory does not suffice
/// @throws TargetError for everything else
void checkTarget(const Photograph& photograph, const std::filesystem::path& target,
                 const WriteOptions& options);

struct PreparedMetadata;
class TargetFile;
class TiffWriter;

/// Writes photographs in the format that the target's extension names, with their metadata: the one of most
/// files, or all pages of a TIFF one after the other, of which one at a time is in memory.
/// The target appears whole or not at all: the bytes go to a temporary name in its folder, which is removed
/// when the object dies, and take the final name once they are on the disk. Without `overwrite` a file that
/// appears under the final name meanwhile is left alone. The target gets the permissions of the source.
class PhotographWriter {
public:
    PhotographWriter(std::filesystem::path target, const WriteOptions& options);
    ~PhotographWriter();
    PhotographWriter(const PhotographWriter&) = delete;
    PhotographWriter& operator=(const PhotographWriter&) = delete;

    /// Adds the only photograph or the next page.
    /// @throws PhotographError when the format is unknown or cannot hold the picture
    /// @throws TargetError when the target cannot be written
    /// @throws StoppedError when `stop` was set
    void add(const Photograph& photograph);

    /// True from the first page on: then there is a temporary file.
    bool hasBegun() const { return mFile != nullptr; }

    /// Gives the target its name, after all pages were added.
    /// @return warnings, one a line: what of the photographs and their metadata could not be carried over
    /// @throws TargetError when the target cannot be written
    /// @throws StoppedError when `stop` was set
    std::vector<std::string> commit();

private:
    struct Note {
        std::string text;
        int page;  ///< the first one that it is about
        int times; ///< the number of them
    };

    void addPage(const Photograph& photograph, PreparedMetadata& prepared);
    void addEncoded(const Photograph& photograph, PreparedMetadata& metadata);
    void take(const std::vector<std::string>& notes, int page);
    std::string prefix(const Note& note) const;

    std::filesystem::path mTarget;
    WriteOptions mOptions;
    std::filesystem::path mSource;
    int mPages = 1;
    std::unique_ptr<TargetFile> mFile;
    std::unique_ptr<TiffWriter> mTiff; ///< null for other formats
    std::vector<Note> mNotes;
};

/// Writes a photograph of one page; see PhotographWriter.
std::vector<std::string> writePhotograph(const Photograph& photograph, const std::filesystem::path& target,
                                         const WriteOptions& options = {});

} // namespace orvela
