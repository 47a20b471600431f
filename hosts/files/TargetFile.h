#pragma once

#include "files/FileFormat.h"

#include <atomic>
#include <string_view>

namespace orvela {

/// Refuses a target that cannot be written: the source itself under any name (also through links), a folder
/// or anything else that is no file, an existing file unless it may be overwritten, a name in a folder that
/// is missing or not writable.
/// @throws TargetError
void checkTargetPath(const std::filesystem::path& target, const std::filesystem::path& source,
                     bool overwrite);

/// True for what takes bytes and keeps none, so that nothing is lost by writing to it: a terminal, a pipe,
/// and this program's standard output and error under any name.
bool isStream(const std::filesystem::path& target);

/// Where a name leads that is a link to a file; else the name itself.
std::filesystem::path linkedFile(const std::filesystem::path& name);

/// Removes the temporaries that killed programs left of the target, not those of living ones.
void removeLeftovers(const std::filesystem::path& target);

/// A file that grows under a temporary name in the target's folder and takes the target's name when it is
/// complete and on the disk. The temporary is removed when the object dies before that; those that killed
/// programs left of the same target are removed when it is made. A stream is written to as it stands.
class TargetFile {
public:
    /// @param source  file whose permissions the target gets; those of any new file when there is none
    /// @throws TargetError
    explicit TargetFile(const std::filesystem::path& target, const std::filesystem::path& source = {});
    ~TargetFile();
    TargetFile(const TargetFile&) = delete;
    TargetFile& operator=(const TargetFile&) = delete;

    /// Appends bytes; `stop`, when given, is looked at after each MiB, and while a stream takes nothing.
    /// @throws TargetError, StoppedError
    void write(ByteView bytes, const std::atomic<bool>* stop = nullptr);
    void write(std::string_view text, const std::atomic<bool>* stop = nullptr);

    /// Gives it the times of the last access and change of `source`, when all is written.
    /// @return whether that could be done
    bool takeTimes(const std::filesystem::path& source);

    /// Writes over bytes that are there already. @throws TargetError
    void overwrite(std::uint64_t at, ByteView bytes);

    /// How much was written.
    std::uint64_t size() const { return mSize; }

    /// Syncs the file, gives it the final name and syncs the folder. Without `overwrite` the system itself
    /// refuses a name that exists.
    /// @throws TargetError
    void commit(bool overwrite);

private:
    void create(const std::filesystem::path& source);
    void rename(bool overwrite);
    void close();

    std::filesystem::path mTarget;
    std::filesystem::path mTemporary; ///< empty for a stream
    int mHandle = -1;
    std::uint64_t mSize = 0;
};

} // namespace orvela
