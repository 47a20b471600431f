#include "files/SourceFile.h"

#include "files/Refusal.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <system_error>

namespace orvela {

namespace {

namespace fs = std::filesystem;

// Without O_NONBLOCK a pipe would be waited for.
int openFile(const fs::path& path) {
    const int handle = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (handle >= 0)
        return handle;
    if (errno == ENOENT || errno == ENOTDIR)
        refuse(path, "there is no such file", "check the name");
    if (errno == EACCES || errno == EPERM)
        refuse(path, "no permission to read it", "ask its owner for read access");
    refuse(path, std::string("cannot be opened (") + std::strerror(errno) + ")", "check the file system");
}

std::uint64_t sizeOf(int handle, const fs::path& path) {
    struct stat status {};
    ::fstat(handle, &status);
    if (S_ISDIR(status.st_mode))
        refuse(path, "is a folder", "name the files in it");
    if (!S_ISREG(status.st_mode))
        refuse(path, "is not a regular file", "save what it gives to a file first");
    return static_cast<std::uint64_t>(status.st_size);
}

[[noreturn]] void refuseShorter(const fs::path& path) {
    refuse(path, "the file became shorter while it was read", "try again when it is complete");
}

} // namespace

SourceFile::SourceFile(fs::path path) : mPath(std::move(path)), mHandle(openFile(mPath)) {
    try {
        mSize = sizeOf(mHandle, mPath);
    } catch (...) {
        ::close(mHandle);
        throw;
    }
}

SourceFile::~SourceFile() {
    ::close(mHandle);
}

Bytes SourceFile::read(std::uint64_t at, std::uint64_t size) const {
    Bytes bytes(size);
    for (std::size_t done = 0; done < bytes.size();) {
        const ssize_t got =
            ::pread(mHandle, bytes.data() + done, bytes.size() - done, static_cast<off_t>(at + done));
        if (got < 0 && errno == EINTR)
            continue;
        if (got < 0)
            refuse(mPath, std::string("cannot be read (") + std::strerror(errno) + ")", "check the disk");
        if (got == 0)
            refuseShorter(mPath);
        done += static_cast<std::size_t>(got);
    }
    return bytes;
}

FileView& SourceFile::view() {
    try {
        if (!mView)
            mView = std::make_unique<FileView>(mHandle, mSize);
    } catch (const std::system_error& error) {
        refuse(mPath, "cannot be read in place (" + error.code().message() + ")", "copy it to another disk");
    }
    return *mView;
}

void SourceFile::checkView() const {
    struct stat status {};
    if (::fstat(mHandle, &status) != 0 || static_cast<std::uint64_t>(status.st_size) < mSize)
        refuseShorter(mPath);
    if (mView->lacksBytes())
        refuse(mPath, "changed while it was read, or cannot be read", "try again, and check the disk");
}

} // namespace orvela
