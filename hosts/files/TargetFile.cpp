#include "files/TargetFile.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstring>
#include <optional>
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

// ".NAME.orvela-": what the temporaries of a target begin with. Two long names may share it, which does no
// harm: it only decides which leftovers are looked at.
std::string temporaryStart(const fs::path& target) {
    std::size_t tellingPart = 100;
    const std::string name = target.filename().string();
    while (tellingPart < name.size() && static_cast<std::uint8_t>(name[tellingPart]) >> 6 == 2)
        --tellingPart; // not within a character
    return '.' + name.substr(0, tellingPart) + ".orvela-";
}

constexpr std::string_view kTemporaryEnd = ".part";
constexpr std::size_t kNumberDigits = 8;

// A name that neither another run nor another photograph of this one takes; creation is exclusive anyway.
fs::path temporaryFor(const fs::path& target) {
    std::array<char, 16> number{};
    std::snprintf(number.data(), number.size(), "%08x", std::random_device()());
    return folderOf(target) / (temporaryStart(target) + number.data() + std::string(kTemporaryEnd));
}

enum class Lock { Mine, Others, Unknown };

// A temporary is locked while its writer lives. Where the file system knows no locks nothing can be told.
Lock lock(int handle) {
    if (::flock(handle, LOCK_EX | LOCK_NB) == 0)
        return Lock::Mine;
    return errno == EWOULDBLOCK ? Lock::Others : Lock::Unknown;
}

void removeIfLeft(const fs::path& temporary) {
    const int handle = ::open(temporary.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC);
    if (handle < 0)
        return;
    if (lock(handle) == Lock::Mine)
        ::unlink(temporary.c_str());
    ::close(handle);
}

bool isTemporary(std::string_view name, std::string_view start) {
    if (!name.starts_with(start) || !name.ends_with(kTemporaryEnd) ||
        name.size() != start.size() + kNumberDigits + kTemporaryEnd.size())
        return false;
    const std::string_view number = name.substr(start.size(), kNumberDigits);
    return number.find_first_not_of("0123456789abcdef") == std::string_view::npos;
}

// A new temporary, locked; none when another program took it for left over before the lock was there.
int createLocked(const fs::path& temporary, mode_t mode) {
    const int handle = ::open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
    struct stat status {};
    if (handle < 0 || (lock(handle) != Lock::Others && ::fstat(handle, &status) == 0 && status.st_nlink > 0))
        return handle;
    ::close(handle);
    errno = EEXIST;
    return -1;
}

// The standard output or error that the file is; none for other files.
std::optional<int> standardHandle(const struct stat& file) {
    for (const int handle : {STDOUT_FILENO, STDERR_FILENO}) {
        struct stat status {};
        if (::fstat(handle, &status) == 0 && status.st_dev == file.st_dev && status.st_ino == file.st_ino)
            return handle;
    }
    return std::nullopt;
}

// To open them by name once more would write over what they hold.
int openStream(const fs::path& target) {
    struct stat status {};
    if (::stat(target.c_str(), &status) != 0)
        return -1;
    if (const std::optional<int> handle = standardHandle(status))
        return ::fcntl(*handle, F_DUPFD_CLOEXEC, 0);
    return ::open(target.c_str(), O_WRONLY | O_NOCTTY | O_CLOEXEC);
}

// Waits until a stream takes PIPE_BUF bytes, or fails; false when it was stopped before.
bool isReady(int handle, const std::atomic<bool>* stop) {
    constexpr int patience = 50; // milliseconds between looks at the stop
    pollfd asked = {handle, POLLOUT, 0};
    const auto stopped = [stop] { return stop != nullptr && *stop; };
    while (::poll(&asked, 1, stopped() ? 0 : patience) == 0)
        if (stopped())
            return false;
    return true;
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
        if (!S_ISREG(there.st_mode))
            refuse(target, "is not a regular file", "choose another name");
        if (standardHandle(there))
            refuse(target, "takes what this program tells", "choose another name");
    } else if (errno == ENAMETOOLONG) {
        refuseSystem(target, errno);
    }
    if (!overwrite && ::lstat(target.c_str(), &there) == 0) {
        removeLeftovers(target); // nothing else will look for them
        refuseExisting(target);
    }
    const fs::path folder = folderOf(target);
    if (::stat(folder.c_str(), &there) != 0)
        refuseSystem(target, errno);
    if (!S_ISDIR(there.st_mode))
        refuseSystem(target, ENOTDIR);
    if (::access(folder.c_str(), W_OK | X_OK) != 0)
        refuseSystem(target, errno);
}

fs::path linkedFile(const fs::path& name) {
    std::error_code error;
    const fs::path real = fs::is_symlink(name, error) ? fs::canonical(name, error) : name;
    return error ? name : real;
}

// A folder that cannot be listed keeps them.
void removeLeftovers(const fs::path& target) {
    const std::string start = temporaryStart(target);
    std::error_code error;
    for (fs::directory_iterator entry(folderOf(target), error), end; !error && entry != end;
         entry.increment(error))
        if (isTemporary(entry->path().filename().string(), start))
            removeIfLeft(entry->path());
}

bool isStream(const fs::path& target) {
    struct stat status {};
    return ::stat(target.c_str(), &status) == 0 && !S_ISDIR(status.st_mode) &&
           (S_ISCHR(status.st_mode) || S_ISFIFO(status.st_mode) || standardHandle(status));
}

TargetFile::TargetFile(const fs::path& target, const fs::path& source) : mTarget(target) {
    if (isStream(target))
        mHandle = openStream(target);
    else
        create(source);
    if (mHandle < 0)
        refuseSystem(mTarget, errno);
}

void TargetFile::create(const fs::path& source) {
    removeLeftovers(mTarget);
    struct stat status {};
    const bool likeSource = !source.empty() && ::stat(source.c_str(), &status) == 0;
    const mode_t mode = likeSource ? status.st_mode & 0777 : 0666;
    do {
        mTemporary = temporaryFor(mTarget);
        mHandle = createLocked(mTemporary, mode);
    } while (mHandle < 0 && errno == EEXIST);
    // The mask for new files has nothing to say here. A file system without permissions has none to keep.
    if (likeSource && mHandle >= 0)
        static_cast<void>(::fchmod(mHandle, mode));
}

TargetFile::~TargetFile() {
    if (mHandle < 0)
        return;
    if (!mTemporary.empty())
        ::unlink(mTemporary.c_str());
    ::close(mHandle);
}

void TargetFile::write(ByteView bytes, const std::atomic<bool>* stop) {
    const std::size_t chunk = mTemporary.empty() ? PIPE_BUF : 1 << 20;
    while (!bytes.empty()) {
        const bool ready = !mTemporary.empty() || isReady(mHandle, stop);
        if (stop != nullptr && (*stop || !ready))
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

void TargetFile::write(std::string_view text, const std::atomic<bool>* stop) {
    write(ByteView(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()), stop);
}

bool TargetFile::takeTimes(const fs::path& source) {
    struct stat status {};
    if (::stat(source.c_str(), &status) != 0)
        return false;
    const std::array<timespec, 2> times = {status.st_atim, status.st_mtim};
    return ::futimens(mHandle, times.data()) == 0;
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
    if (mTemporary.empty()) {
        close();
        return;
    }
    if (::fsync(mHandle) != 0)
        refuseSystem(mTarget, errno);
    rename(overwrite);
    close();
    const int folder = ::open(folderOf(mTarget).c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (folder >= 0) {
        // A file system that cannot sync folders has nothing better to offer.
        static_cast<void>(::fsync(folder));
        ::close(folder);
    }
}

// Some file systems report a full disk only here.
void TargetFile::close() {
    const int closed = ::close(mHandle);
    mHandle = -1;
    if (closed != 0)
        refuseSystem(mTarget, errno);
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
