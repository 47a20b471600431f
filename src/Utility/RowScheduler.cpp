#include "Utility/RowScheduler.h"

#include "Utility/Logger.h"

#include <tbb/blocked_range.h>
#include <tbb/global_control.h>
#include <tbb/info.h>
#include <tbb/parallel_for.h>
#include <tbb/partitioner.h>
#include <tbb/task_arena.h>

#include <latch>
#include <system_error>
#include <thread>
#include <vector>

#if defined(__SANITIZE_THREAD__)
#include <sanitizer/tsan_interface.h>
#endif

namespace orvela {

struct RowScheduler::Impl {
    tbb::task_scheduler_handle handle{tbb::attach{}};
    std::unique_ptr<tbb::global_control> limit;
    tbb::task_arena arena;
};

namespace {

// The thread sanitizer does not see the ordering that the uninstrumented TBB library guarantees between the
// caller of a pass and its bodies; these calls state exactly that guarantee.
#if defined(__SANITIZE_THREAD__)
void handOver(const void* pass) {
    __tsan_release(const_cast<void*>(pass));
}
void takeOver(const void* pass) {
    __tsan_acquire(const_cast<void*>(pass));
}
#else
void handOver(const void*) {}
void takeOver(const void*) {}
#endif

// Whether so many threads can run beside the calling one. A worker that cannot be started is one that the
// library waits for, without end, before it lets go of its workers.
bool canStart(int threads) {
    std::latch end(1);
    std::vector<std::thread> started;
    started.reserve(static_cast<std::size_t>(threads));
    bool can = true;
    try {
        for (int i = 0; i < threads; ++i)
            started.emplace_back([&end] { end.wait(); });
    } catch (const std::system_error&) {
        can = false;
    }
    end.count_down();
    for (std::thread& thread : started)
        thread.join();
    return can;
}

} // namespace

RowScheduler::RowScheduler(int threads) : mImpl(std::make_unique<Impl>()) {
    if (!canStart((threads >= 1 ? threads : defaultThreads()) - 1))
        threads = 1;
    // The library keeps to one thread per processor otherwise. The limit holds for the whole process, so a
    // scheduler with fewer threads must not set it.
    if (threads > defaultThreads()) {
        mImpl->limit = std::make_unique<tbb::global_control>(tbb::global_control::max_allowed_parallelism,
                                                             static_cast<std::size_t>(threads));
    }
    mImpl->arena.initialize(threads >= 1 ? threads : int(tbb::task_arena::automatic));
}

RowScheduler::~RowScheduler() {
    mImpl->arena.terminate();
    mImpl->limit.reset();
    tbb::finalize(mImpl->handle, std::nothrow);
}

void RowScheduler::execute(const std::function<void()>& action) {
    mImpl->arena.execute(action);
}

int RowScheduler::defaultThreads() {
    return tbb::info::default_concurrency();
}

void forEachRange(unsigned begin, unsigned end, unsigned grain,
                  const std::function<void(unsigned, unsigned)>& body) {
    if (end <= begin)
        return;
    const LogDepth::Binding caller = LogDepth::current();
    handOver(&body);
    tbb::parallel_for(
        tbb::blocked_range<unsigned>(begin, end, grain),
        [&](const tbb::blocked_range<unsigned>& piece) {
            takeOver(&body);
            const LogDepth depth(caller);
            body(piece.begin(), piece.end());
            handOver(&body);
        },
        tbb::simple_partitioner());
    takeOver(&body);
}

} // namespace orvela
