#pragma once

#include <functional>
#include <memory>

/// The engine's one door to parallelism.
namespace orvela {

/// A number of threads for the passes that run inside execute(). Several can be used side by side, each by
/// one thread at a time; passes outside of any use one thread per processor. More threads than processors are
/// had as far as every living scheduler that asks for more allows.
class RowScheduler {
public:
    /// Uses the calling thread alone when the system does not grant as many.
    /// @param threads  number of threads, or below 1 for the automatic choice (one per processor)
    explicit RowScheduler(int threads);
    /// Ends the worker threads that no other scheduler uses.
    ~RowScheduler();
    RowScheduler(const RowScheduler&) = delete;
    RowScheduler& operator=(const RowScheduler&) = delete;

    /// Calls `action` on the calling thread; the passes in it use this scheduler's threads. An exception of
    /// the action reaches the caller.
    void execute(const std::function<void()>& action);

    /// The automatic number of threads on this machine.
    static int defaultThreads();

private:
    struct Impl;
    std::unique_ptr<Impl> mImpl;
};

/// Calls `body(begin, end)` for pieces that together cover [begin, end), on the scheduler's threads, in any
/// order. The range is halved, the upper piece starting at begin + (end - begin) / 2, until no piece holds
/// more than `grain` indices. An exception thrown by a body cancels the pieces not yet started and reaches
/// the caller as it was thrown; a range with end <= begin is empty.
void forEachRange(unsigned begin, unsigned end, unsigned grain,
                  const std::function<void(unsigned begin, unsigned end)>& body);

} // namespace orvela
