#include "files/TargetFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <random>
#include <string>

namespace orvela {

namespace {

namespace fs = std::filesystem;

[[noreturn]] void refuse(const fs::path& target, const std::string& cause, const std::string& advice) {
    throw TargetError(target.string() + ": " + cause + "; " + advice);
}

[[noreturn]] void refuseExisting(const fs::path& target) {
    refuse(target, "exists already", "use --force to overwrite it");
}

[[noreturn]] void refuseSystem(const fs::path& target, int error) {
    switch (error) {
    case ENOENT:
        refuse(target, "its folder does not exist", "create the folder first");
    case ENOTDIR:
        refuse(target, "part of its path is not a folder", "correct the path");
    case EACCES:
    case EPERM:
        refuse(target, "no permission to write in its folder",
               "choose another folder or ask for write access");
    case EROFS:
        refuse(target, "its file system is read-only", "choose another folder");
    case ENOSPC:
    case EDQUOT:
        refuse(target, "the disk is full", "free some space or choose another folder");
    case EFBIG:
        refuse(target, "the file is larger than the system allows",
               "raise the limit or choose another format");
    case ENAMETOOLONG:
        refuse(target, "the name is too long", "choose a shorter one");
    case EISDIR:
        refuse(target, "is a folder", "name a file in it");
    default:
        refuse(target, std::string("cannot be written (") + std::strerror(error) + ")", "check the disk");
    }
}

fs::path folderOf(const fs::path& target) {
    return target.has_parent_path() ? target.parent_path() : fs::path(".");
}

// A name that neither another run nor another photograph of this one takes; creation is exclusive anyway.
fs::path temporaryFor(const fs::path& target) {
    std::random_device random;
    std::array<char, 40> name{};
    std::snprintf(name.data(), name.size(), ".orvela-%08x%08x.part", random(), random());
    return folderOf(target) / name.data();
}

} // namespace

void checkTargetPath(const fs::path& target, const fs::path& source, bool overwrite) {
    struct stat there {};
    struct stat origin {};
    if (::stat(target.c_str(), &there) == 0) {
        if (S_ISDIR(there.st_mode))
            refuseSystem(target, EISDIR);
        if (!source.empty() && ::stat(source.c_str(), &origin) == 0 && there.st_dev == origin.st_dev &&
            there.st_ino == origin.st_ino)
            refuse(target, "is the photograph itself", "choose another name; the source is never replaced");
    }
    if (!overwrite && ::lstat(target.c_str(), &there) == 0)
        refuseExisting(target);
    const fs::path folder = folderOf(target);
    if (::stat(folder.c_str(), &there) != 0)
        refuseSystem(target, errno);
    if (!S_ISDIR(there.st_mode))
        refuseSystem(target, ENOTDIR);
    if (::access(folder.c_str(), W_OK | X_OK) != 0)
        refuseSystem(target, errno);
}

TargetFile::TargetFile(const fs::path& target) : mTarget(target), mTemporary(temporaryFor(target)) {
    mHandle = ::open(mTemporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    if (mHandle < 0)
        refuseSystem(mTarget, errno);
}

TargetFile::~TargetFile() {
    if (mHandle < 0)
        return;
    ::close(mHandle);
    ::unlink(mTemporary.c_str());
}

void TargetFile::write(ByteView bytes, const std::atomic<bool>* stop) {
    constexpr std::size_t chunk = 1 << 20;
    while (!bytes.empty()) {
        if (stop != nullptr && *stop)
            throw StoppedError(mTarget.string() + ": stopped; nothing was written");
        const ssize_t written = ::write(mHandle, bytes.data(), std::min(chunk, bytes.size()));
        if (written < 0 && errno != EINTR)
            refuseSystem(mTarget, errno);
        const auto count = static_cast<std::size_t>(std::max<ssize_t>(0, written));
        bytes = bytes.subspan(count);
        mSize += count;
    }
    if (stop != nullptr && *stop)
        throw StoppedError(mTarget.string() + ": stopped; nothing was written");
}

void TargetFile::overwrite(std::uint64_t at, ByteView bytes) {
    while (!bytes.empty()) {
        const ssize_t written = ::pwrite(mHandle, bytes.data(), bytes.size(), static_cast<off_t>(at));
        if (written < 0 && errno != EINTR)
            refuseSystem(mTarget, errno);
        const auto count = static_cast<std::size_t>(std::max<ssize_t>(0, written));
        bytes = bytes.subspan(count);
        at += count;
    }
}

void TargetFile::commit(bool overwrite) {
    if (::fsync(mHandle) != 0)
        refuseSystem(mTarget, errno);
    rename(overwrite);
    // Some file systems report a full disk only here.
    const int closed = ::close(mHandle);
    mHandle = -1;
    if (closed != 0)
        refuseSystem(mTarget, errno);
    const int folder = ::open(folderOf(mTarget).c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (folder >= 0) {
        // A file system that cannot sync folders has nothing better to offer.
        static_cast<void>(::fsync(folder));
        ::close(folder);
    }
}

void TargetFile::rename(bool overwrite) {
    if (overwrite) {
        if (::rename(mTemporary.c_str(), mTarget.c_str()) != 0)
            refuseSystem(mTarget, errno);
        return;
    }
    if (::renameat2(AT_FDCWD, mTemporary.c_str(), AT_FDCWD, mTarget.c_str(), RENAME_NOREPLACE) == 0)
        return;
    // Not every file system knows the exclusive rename; a second name for the file is as exclusive.
    if ((errno == EINVAL || errno == ENOSYS) && ::link(mTemporary.c_str(), mTarget.c_str()) == 0) {
        ::unlink(mTemporary.c_str());
        return;
    }
    if (errno == EEXIST)
        refuseExisting(mTarget);
    refuseSystem(mTarget, errno);
}

} // namespace orvela
