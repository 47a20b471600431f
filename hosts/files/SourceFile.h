#pragma once

#include "files/FileFormat.h"
#include "files/FileView.h"

#include <memory>

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

    /// What `parse` makes of the whole file, of which it gets a view that holds as long as it runs.
    /// @throws PhotographError when the file became shorter or the disk fails; std::bad_alloc
    template <typename Parse>
    auto look(const Parse& parse) {
        FileView& file = view();
        try {
            const FileView::Look look(file);
            auto result = parse(file.bytes());
            checkView();
            return result;
        } catch (...) {
            checkView();
            throw;
        }
    }

private:
    FileView& view();
    void checkView() const;

    std::filesystem::path mPath;
    int mHandle = -1;
    std::uint64_t mSize = 0;
    std::unique_ptr<FileView> mView;
};

} // namespace orvela
