#pragma once

#include "files/FileFormat.h"

namespace orvela {

/// A file that is open for reading.
class SourceFile {
public:
    /// @throws PhotographError when the file is missing, no regular file or may not be read
    explicit SourceFile(std::filesystem::path path);
    ~SourceFile();
    SourceFile(const SourceFile&) = delete;
    SourceFile& operator=(const SourceFile&) = delete;

    const std::filesystem::path& path() const { return mPath; }
    std::uint64_t size() const { return mSize; }

    /// For libraries that read by themselves.
    int handle() const { return mHandle; }

    /// `size` bytes from `at` on, which the file has.
    /// @throws PhotographError when the disk fails or the file became shorter
    Bytes read(std::uint64_t at, std::uint64_t size) const;

    /// The whole file in the address space, to be looked at at once. Memory is taken by what is looked at
    /// only, and can be taken back.
    /// @throws PhotographError when the file became shorter; std::bad_alloc
    ByteView view();

private:
    std::filesystem::path mPath;
    int mHandle = -1;
    std::uint64_t mSize = 0;
    void* mView = nullptr;
};

} // namespace orvela
