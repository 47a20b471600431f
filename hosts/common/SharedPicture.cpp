#include "common/SharedPicture.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <new>
#include <system_error>

namespace orvela {

namespace {

constexpr std::size_t kSamples = 4096; // where they begin: at a page

static_assert(sizeof(SharedPicture::Head) <= kSamples);

[[noreturn]] void refuse(int error) {
    throw std::system_error(error, std::generic_category(), "the picture for the windows");
}

// All of it is asked for now, and nobody makes it smaller: a page that is missing later would end a process.
void reserve(int handle, std::size_t size) {
    int error = EINTR;
    while (error == EINTR)
        error = ::posix_fallocate(handle, 0, static_cast<off_t>(size));
    if (error == EFBIG)
        refuse(error);
    if (error != 0 || ::fcntl(handle, F_ADD_SEALS, F_SEAL_SHRINK | F_SEAL_GROW) != 0)
        throw std::bad_alloc();
}

} // namespace

SharedPicture::SharedPicture(const PictureShape& shape)
    : mHandle(::memfd_create("orvela-picture", MFD_CLOEXEC | MFD_ALLOW_SEALING)), mShape(shape) {
    const std::size_t size = kSamples + 2 * shape.bytes();
    try {
        reserve(mHandle, size);
        map(size);
    } catch (...) {
        ::close(mHandle);
        throw;
    }
    new (mHead) Head{};
    mHead->shape = shape;
}

SharedPicture::SharedPicture(int handle) : mHandle(handle) {
    struct stat status {};
    if (::fstat(handle, &status) != 0)
        refuse(errno);
    const auto size = static_cast<std::size_t>(status.st_size);
    if (size < kSamples)
        refuse(EINVAL);
    ::fcntl(handle, F_SETFD, FD_CLOEXEC);
    map(size);
    mShape = mHead->shape;
    if (size == kSamples + 2 * mShape.bytes())
        return;
    ::munmap(mHead, mSize);
    refuse(EINVAL);
}

SharedPicture::~SharedPicture() {
    ::munmap(mHead, mSize);
    ::close(mHandle);
}

void SharedPicture::map(std::size_t size) {
    void* memory = ::mmap(nullptr, size, PROT_READ | PROT_WRITE, MAP_SHARED, mHandle, 0);
    if (memory == MAP_FAILED)
        throw std::bad_alloc();
    mHead = static_cast<Head*>(memory);
    mSize = size;
}

std::span<std::uint8_t> SharedPicture::source() {
    return {reinterpret_cast<std::uint8_t*>(mHead) + kSamples, mShape.bytes()};
}

std::span<std::uint8_t> SharedPicture::result() {
    return {source().data() + source().size(), source().size()};
}

void setText(std::span<char> field, std::string_view text) {
    const auto length = std::min(text.size(), field.size() - 1);
    std::copy_n(text.begin(), length, field.begin());
    field[length] = 0;
}

} // namespace orvela
