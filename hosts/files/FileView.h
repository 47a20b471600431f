#pragma once

#include "metadata/Bytes.h"

#include <csignal>

namespace orvela {

/// A file in the address space. Memory is taken by what is looked at only, and can be taken back.
class FileView {
public:
    /// @throws std::bad_alloc, and std::system_error where the file system has no views
    FileView(int handle, std::size_t size);
    ~FileView();
    FileView(const FileView&) = delete;
    FileView& operator=(const FileView&) = delete;

    ByteView bytes() const { return {static_cast<const std::uint8_t*>(mStart), mSize}; }

    /// While one exists the thread may look at the bytes, one view at a time: those that the file does not
    /// hold any more, or the disk does not give, are zero, where the system would end the program.
    class Look {
    public:
        explicit Look(FileView& view);
        ~Look();
        Look(const Look&) = delete;
        Look& operator=(const Look&) = delete;
    };

    /// Whether bytes were missing.
    bool lacksBytes() const { return mLacksBytes != 0; }

private:
    static void onMissingPage(int signal, siginfo_t* info, void*);
    /// Turns a missing page and those behind it into pages of zeros; false where it is none of the file's.
    bool fillFrom(const void* missing);

    void* mStart;
    std::size_t mSize;
    volatile std::sig_atomic_t mLacksBytes = 0;
};

} // namespace orvela
