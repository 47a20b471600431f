#include "files/FileView.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <new>
#include <system_error>

namespace orvela {

namespace {

constinit thread_local FileView* lookedAt = nullptr;
struct sigaction earlierAction {};

} // namespace

// Only what a handler of signals may do. What is not a view's is left to whoever cared for the signal before,
// and comes again at once.
void FileView::onMissingPage(int signal, siginfo_t* info, void*) {
    const int error = errno;
    FileView* const view = lookedAt;
    if (view == nullptr || info->si_code != BUS_ADRERR || !view->fillFrom(info->si_addr)) {
        ::sigaction(signal, &earlierAction, nullptr);
        ::raise(signal); // once this returns
    }
    errno = error;
}

bool FileView::fillFrom(const void* missing) {
    auto* const start = static_cast<std::uint8_t*>(mStart);
    const auto* const at = static_cast<const std::uint8_t*>(missing);
    if (at < start || at >= start + mSize)
        return false;
    const auto page = static_cast<std::size_t>(::sysconf(_SC_PAGESIZE));
    const std::size_t first = static_cast<std::size_t>(at - start) / page * page;
    mLacksBytes = 1;
    return ::mmap(start + first, mSize - first, PROT_READ, MAP_PRIVATE | MAP_ANONYMOUS | MAP_FIXED, -1, 0) !=
           MAP_FAILED;
}

FileView::FileView(int handle, std::size_t size)
    : mStart(::mmap(nullptr, size, PROT_READ, MAP_PRIVATE, handle, 0)), mSize(size) {
    if (mStart != MAP_FAILED)
        return;
    if (errno == ENOMEM || errno == EAGAIN)
        throw std::bad_alloc();
    throw std::system_error(errno, std::generic_category());
}

FileView::~FileView() {
    ::munmap(mStart, mSize);
}

FileView::Look::Look(FileView& view) {
    static const bool ready = [] {
        struct sigaction action {};
        action.sa_sigaction = onMissingPage;
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
