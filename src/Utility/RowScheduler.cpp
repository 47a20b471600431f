#include "Utility/RowScheduler.h"

#include "Utility/Logger.h"

#include <tbb/blocked_range.h>
#include <tbb/global_control.h>
#include <tbb/info.h>
#include <tbb/parallel_for.h>
#include <tbb/partitioner.h>
#include <tbb/task_arena.h>

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

} // namespace

RowScheduler::RowScheduler(int threads) : mImpl(std::make_unique<Impl>()) {
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
