#include "command/StopSignals.h"

#include "command/ExitStatus.h"

#include <pthread.h>

#include <cstdlib>

namespace orvela {

namespace {

constexpr int kStopSignals[] = {SIGINT, SIGTERM};
constexpr int kWakeSignal = SIGUSR1;

bool isIgnored(int signal) {
    struct sigaction action = {};
    return sigaction(signal, nullptr, &action) == 0 && action.sa_handler == SIG_IGN;
}

} // namespace

StopSignals::StopSignals() {
    sigemptyset(&mSignals);
    sigaddset(&mSignals, kWakeSignal);
    for (const int signal : kStopSignals) {
        // A shell script starts background commands with these ignored, and ignored signals cannot be waited
        // for.
        std::signal(signal, SIG_DFL);
        sigaddset(&mSignals, signal);
    }
    if (!isIgnored(SIGHUP))
        sigaddset(&mSignals, SIGHUP);
    pthread_sigmask(SIG_BLOCK, &mSignals, nullptr);
    mThread = std::thread([this] { wait(); });
}

StopSignals::~StopSignals() {
    mEnding = true;
    pthread_kill(mThread.native_handle(), kWakeSignal);
    mThread.join();
}

void StopSignals::onStop(std::function<void()> stop) {
    const std::lock_guard lock(mMutex);
    mStop = std::move(stop);
    if (mStop && mStopRequested)
        mStop();
}

void StopSignals::onLeave(std::function<void()> tidy) {
    const std::lock_guard lock(mMutex);
    mTidy = std::move(tidy);
}

// Called by an action, which holds the mutex.
void StopSignals::leave() const {
    if (mStay)
        return;
    if (mTidy)
        mTidy();
    std::_Exit(kSignalBase + mReceived);
}

void StopSignals::wait() {
    int signal = 0;
    while (sigwait(&mSignals, &signal) == 0 && !mEnding)
        if (signal != kWakeSignal)
            take(signal);
}

void StopSignals::take(int signal) {
    int none = 0;
    mReceived.compare_exchange_strong(none, signal);
    mStopRequested = true;
    const std::lock_guard lock(mMutex);
    if (mStop)
        mStop();
}

} // namespace orvela
