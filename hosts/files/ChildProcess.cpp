#include "files/ChildProcess.h"

#include "files/Photograph.h"

#include <fcntl.h>
#include <malloc.h>
#include <poll.h>
#include <pthread.h>
#include <sys/mman.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <time.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <fstream>
#include <new>
#include <system_error>

namespace orvela {

namespace {

constexpr int kLookAgain = 100;         // milliseconds
constexpr std::size_t kStack = 1 << 20; // bytes
constexpr int kMostIdle = 100; // looks without any work done: a thread waits for another that never started

} // namespace

/// What the child tells beside its bytes.
struct ChildProcess::Outcome {
    bool lacksMemory;
    std::array<char, 400> failure;
};

namespace {

bool* lacksMemory = nullptr; // in the child: where it tells so

[[noreturn]] void endForLackOfMemory() {
    *lacksMemory = true;
    ::_exit(1);
}

// Neither messages of the libraries nor a core file, and no life of its own: where the system ends processes
// for want of memory, it is to take this one. In a small address space a codec may wait for a thread that
// could not start: stacks of a usual size are eight times what codecs are content with elsewhere, and a heap
// for each thread takes the room of all.
void detach() {
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    ::prctl(PR_SET_DUMPABLE, 0);
    std::ofstream("/proc/self/oom_score_adj") << 1000;
    const int nowhere = ::open("/dev/null", O_RDWR);
    for (const int handle : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
        ::dup2(nowhere, handle);
    ::mallopt(M_ARENA_MAX, 1);
    pthread_attr_t attributes{};
    ::pthread_attr_init(&attributes);
    ::pthread_attr_setstacksize(&attributes, kStack);
    ::pthread_setattr_default_np(&attributes);
    ::pthread_attr_destroy(&attributes);
}

} // namespace

void ChildProcess::Sink::send(const void* data, std::size_t size) const {
    const auto* bytes = static_cast<const std::uint8_t*>(data);
    while (size > 0) {
        const ssize_t sent = ::write(mPipe, bytes, size);
        if (sent < 0 && errno == EINTR)
            continue;
        if (sent < 0)
            ::_exit(1);
        bytes += sent;
        size -= static_cast<std::size_t>(sent);
    }
}

ChildProcess::ChildProcess(const std::function<void(const Sink&)>& work) {
    void* shared =
        ::mmap(nullptr, sizeof(Outcome), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    if (shared == MAP_FAILED)
        throw std::bad_alloc();
    mOutcome = new (shared) Outcome{};
    int ends[2] = {-1, -1};
    if (::pipe2(ends, O_CLOEXEC) == 0)
        mChild = ::fork();
    const int error = errno;
    if (mChild == 0)
        run(work, ends[1]);
    ::close(ends[1]);
    mPipe = ends[0];
    if (mChild > 0)
        return;
    ::close(mPipe);
    ::munmap(mOutcome, sizeof(Outcome));
    if (error == ENOMEM || error == EAGAIN)
        throw std::bad_alloc();
    throw ChildFailure(std::string("no process can be started: ") + std::strerror(error));
}

ChildProcess::~ChildProcess() {
    ::kill(mChild, SIGKILL);
    while (::waitpid(mChild, nullptr, 0) < 0 && errno == EINTR) {
    }
    ::close(mPipe);
    ::munmap(mOutcome, sizeof(Outcome));
}

void ChildProcess::run(const std::function<void(const Sink&)>& work, int pipe) {
    detach();
    lacksMemory = &mOutcome->lacksMemory;
    std::set_new_handler(endForLackOfMemory);
    try {
        work(Sink(pipe));
        ::_exit(0);
    } catch (const std::bad_alloc&) {
        mOutcome->lacksMemory = true;
    } catch (const std::system_error& error) {
        mOutcome->lacksMemory = error.code() == std::errc::resource_unavailable_try_again; // no new thread
        std::strncpy(mOutcome->failure.data(), error.what(), mOutcome->failure.size() - 1);
    } catch (const std::exception& error) {
        std::strncpy(mOutcome->failure.data(), error.what(), mOutcome->failure.size() - 1);
    }
    ::_exit(1);
}

void ChildProcess::receive(void* data, std::size_t size, const std::atomic<bool>* stop) {
    auto* bytes = static_cast<std::uint8_t*>(data);
    while (size > 0) {
        waitForBytes(stop);
        const ssize_t got = ::read(mPipe, bytes, size);
        if (got < 0 && errno == EINTR)
            continue;
        if (got <= 0)
            reportEnd();
        bytes += got;
        size -= static_cast<std::size_t>(got);
    }
}

void ChildProcess::waitForBytes(const std::atomic<bool>* stop) {
    pollfd pipe{mPipe, POLLIN, 0};
    while (::poll(&pipe, 1, kLookAgain) <= 0) {
        if (stop != nullptr && *stop)
            throw StoppedError("stopped; nothing was written");
        const double spent = processorSeconds();
        mIdle = spent == mSpent ? mIdle + 1 : 0;
        mSpent = spent;
        if (mIdle > kMostIdle)
            throw ChildFailure("the codec hangs");
    }
    mIdle = 0;
}

double ChildProcess::processorSeconds() const {
    clockid_t clock{};
    timespec time{};
    if (::clock_getcpuclockid(mChild, &clock) != 0 || ::clock_gettime(clock, &time) != 0)
        return -1;
    return static_cast<double>(time.tv_sec) + 1e-9 * static_cast<double>(time.tv_nsec);
}

// The child stays until the destructor has waited for it.
void ChildProcess::reportEnd() {
    siginfo_t end{};
    while (::waitid(P_PID, static_cast<id_t>(mChild), &end, WEXITED | WNOWAIT) < 0 && errno == EINTR) {
    }
    const bool killed = end.si_code == CLD_KILLED && end.si_status == SIGKILL; // by the system, out of memory
    if (mOutcome->lacksMemory || killed)
        throw std::bad_alloc();
    if (end.si_code != CLD_EXITED)
        throw ChildFailure("the codec ended by signal " + std::to_string(end.si_status));
    throw ChildFailure(mOutcome->failure.data());
}

} // namespace orvela
