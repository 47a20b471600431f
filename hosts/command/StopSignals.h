#pragma once

#include <atomic>
#include <csignal>
#include <functional>
#include <mutex>
#include <thread>

namespace orvela {

/// Turns the signals that ask a program to end into a flag and a call, on a thread of its own, so that the
/// work can stop in good order. Made first in the program: threads started before it would still die of the
/// signals. SIGINT and SIGTERM always count, SIGHUP unless it was ignored when the program started.
class StopSignals {
public:
    StopSignals();
    ~StopSignals();
    StopSignals(const StopSignals&) = delete;
    StopSignals& operator=(const StopSignals&) = delete;

    /// Number of the first signal that arrived, 0 while there was none.
    int received() const { return mReceived; }

    /// True from the first signal on; may be handed to whoever can stop early.
    const std::atomic<bool>& stopRequested() const { return mStopRequested; }

    /// Ends the program at once with the status of the signal, unless it has to stay.
    void leave() const;

    /// Whether leaving at once would leave something behind; then the work ends in good order.
    void stay(bool needed) { mStay = needed; }

private:
    friend class StopAction;
    friend class LeaveAction;

    void onStop(std::function<void()> stop);
    void onLeave(std::function<void()> tidy);

    void wait();
    void take(int signal);

    sigset_t mSignals;
    std::atomic<int> mReceived = 0;
    std::atomic<bool> mStopRequested = false;
    std::atomic<bool> mEnding = false;
    std::atomic<bool> mStay = false;
    std::mutex mMutex;
    std::function<void()> mStop;
    std::function<void()> mTidy; ///< what leave() calls first
    std::thread mThread;
};

/// While it lives, `stop` is called on the signal thread at every signal, at once when one has arrived
/// already. One at a time.
class StopAction {
public:
    StopAction(StopSignals& signals, std::function<void()> stop) : mSignals(signals) {
        mSignals.onStop(std::move(stop));
    }
    ~StopAction() { mSignals.onStop(nullptr); }
    StopAction(const StopAction&) = delete;
    StopAction& operator=(const StopAction&) = delete;

private:
    StopSignals& mSignals;
};

/// While it lives, `tidy` is called before the signals end the program at once, on the signal thread.
class LeaveAction {
public:
    LeaveAction(StopSignals& signals, std::function<void()> tidy) : mSignals(signals) {
        mSignals.onLeave(std::move(tidy));
    }
    ~LeaveAction() { mSignals.onLeave(nullptr); }
    LeaveAction(const LeaveAction&) = delete;
    LeaveAction& operator=(const LeaveAction&) = delete;

private:
    StopSignals& mSignals;
};

} // namespace orvela
