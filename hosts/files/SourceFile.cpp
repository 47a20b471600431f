#include "files/SourceFile.h"

#include "files/Memory.h"
#include "files/Refusal.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace orvela {

namespace {

namespace fs = std::filesystem;

/// A file opened for reading, closed at the end.
class OpenFile {
public:
    // Without O_NONBLOCK a pipe would be waited for.
    explicit OpenFile(const fs::path& path)
        : mHandle(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK)) {
        if (mHandle >= 0)
            return;
        if (errno == ENOENT || errno == ENOTDIR)
            refuse(path, "there is no such file", "check the name");
        if (errno == EACCES || errno == EPERM)
            refuse(path, "no permission to read it", "ask its owner for read access");
        refuse(path, std::string("cannot be opened (") + std::strerror(errno) + ")", "check the file system");
    }
    ~OpenFile() { ::close(mHandle); }
    OpenFile(const OpenFile&) = delete;
    OpenFile& operator=(const OpenFile&) = delete;

    int handle() const { return mHandle; }

private:
    int mHandle;
};

std::size_t sizeOf(const OpenFile& file, const fs::path& path, std::uintmax_t most, std::uint64_t left) {
    struct stat status {};
    ::fstat(file.handle(), &status);
    if (S_ISDIR(status.st_mode))
        refuse(path, "is a folder", "name the files in it");
    if (!S_ISREG(status.st_mode))
        refuse(path, "is not a regular file", "save what it gives to a file first");
    const auto size = static_cast<std::uint64_t>(status.st_size);
    if (size > most)
        refuse(path, "is larger than " + amountOf(most), "name another file");
    if (const std::uint64_t granted = obtainableMemory(); size + left > granted)
        throw MemoryError(path.string() + ": its file of " + amountOf(size) + " needs more memory than the " +
                          amountOf(granted) + " that can be had; " + kMemoryAdvice);
    return size;
}

} // namespace

Bytes readWholeFile(const fs::path& path, std::uintmax_t most, std::uint64_t left) {
    const OpenFile file(path);
    Bytes bytes(sizeOf(file, path, most, left));
    for (std::size_t at = 0; at < bytes.size();) {
        const ssize_t got = ::read(file.handle(), bytes.data() + at, bytes.size() - at);
        if (got < 0 && errno == EINTR)
            continue;
        if (got < 0)
            refuse(path, std::string("cannot be read (") + std::strerror(errno) + ")", "check the disk");
        if (got == 0)
            refuse(path, "the file became shorter while it was read", "try again when it is complete");
        at += static_cast<std::size_t>(got);
    }
    return bytes;
}

} // namespace orvela
