#pragma once

#include "files/FileFormat.h"

#include <atomic>

namespace orvela {

/// Refuses a target that cannot be written: the source itself under any name (also through links), a folder,
/// an existing file unless it may be overwritten, a name in a folder that is missing or not writable.
/// @throws TargetError
void checkTargetPath(const std::filesystem::path& target, const std::filesystem::path& source,
                     bool overwrite);

/// A file that grows under a temporary name in the target's folder and takes the target's name when it is
/// complete and on the disk. The temporary is removed when the object dies before that.
class TargetFile {
public:
    /// Creates the temporary with the permissions of any new file.
    /// @throws TargetError
    explicit TargetFile(const std::filesystem::path& target);
    ~TargetFile();
    TargetFile(const TargetFile&) = delete;
    TargetFile& operator=(const TargetFile&) = delete;

    /// Appends bytes; `stop`, when given, is looked at after each MiB.
    /// @throws TargetError, StoppedError
    void write(ByteView bytes, const std::atomic<bool>* stop);

    /// Writes over bytes that are there already. @throws TargetError
    void overwrite(std::uint64_t at, ByteView bytes);

    /// How much was written.
    std::uint64_t size() const { return mSize; }

    /// Syncs the file, gives it the final name and syncs the folder. Without `overwrite` the system itself
    /// refuses a name that exists.
    /// @throws TargetError
    void commit(bool overwrite);

private:
    void rename(bool overwrite);

    std::filesystem::path mTarget;
    std::filesystem::path mTemporary;
    int mHandle = -1;
    std::uint64_t mSize = 0;
};

} // namespace orvela
