#include "files/FileView.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <new>

namespace orvela {

namespace {

constinit thread_local FileView* lookedAt = nullptr;
struct sigaction earlierAction {};

} // namespace

// Only what a handler of signals may do: a missing page and those behind it become pages of zeros. What is
// not a view's is left to whoever cared for the signal before, and comes again at once.
void FileView::fill(int signal, siginfo_t* info, void*) {
    const int error = errno;
    FileView* const view = lookedAt;
    const auto missing = view == nullptr ? ByteView() : view->bytes();
    const auto* const at = static_cast<const std::uint8_t*>(info->si_addr);
    bool filled = false;
    if (info->si_code == BUS_ADRERR && at >= missing.data() && at < missing.data() + missing.size()) {
        const auto page = static_cast<std::size_t>(::sysconf(_SC_PAGESIZE));
        const std::size_t first = static_cast<std::size_t>(at - missing.data()) / page * page;
        filled = ::mmap(static_cast<std::uint8_t*>(view->mStart) + first, view->mSize - first, PROT_READ,
                        MAP_PRIVATE | MAP_ANONYMOUS | MAP_FIXED, -1, 0) != MAP_FAILED;
        view->mLacksBytes = 1;
    }
    if (!filled) {
        ::sigaction(signal, &earlierAction, nullptr);
        ::raise(signal); // once this returns
    }
    errno = error;
}

FileView::FileView(int handle, std::size_t size)
    : mStart(::mmap(nullptr, size, PROT_READ, MAP_PRIVATE, handle, 0)), mSize(size) {
    if (mStart == MAP_FAILED)
        throw std::bad_alloc();
}

FileView::~FileView() {
    ::munmap(mStart, mSize);
}

FileView::Look::Look(FileView& view) {
    static const bool ready = [] {
        struct sigaction action {};
        action.sa_sigaction = fill;
        action.sa_flags = SA_SIGINFO;
        return ::sigaction(SIGBUS, &action, &earlierAction) == 0;
    }();
    static_cast<void>(ready);
    lookedAt = &view;
}

FileView::Look::~Look() {
    lookedAt = nullptr;
}

} // namespace orvela
