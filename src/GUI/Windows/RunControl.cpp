#include "GUI/Windows/RunControl.h"

#include <QScopedValueRollback>

#include <utility>

namespace orvela {

namespace {
constexpr int kRefreshMilliseconds = 1000;
}

RunControl::RunControl(Window& window) : mWindow(window) {
    for (QTimer* timer : {&mTimer, &mGoOnTimer})
        timer->setSingleShot(true);
    mTimer.setInterval(kRefreshMilliseconds);
    mTimer.setObjectName(QStringLiteral("refreshTimer"));
    connect(&mTimer, &QTimer::timeout, this, &RunControl::refreshByItself);
    connect(&mGoOnTimer, &QTimer::timeout, this, &RunControl::goOn);
}

void RunControl::setAutomatic(bool automatic) {
    mAutomatic = automatic;
    if (!automatic)
        mTimer.stop();
}

void RunControl::startTimer() {
    if (mAutomatic)
        mTimer.start();
}

void RunControl::settingsChanged() {
    mUpToDate = false;
    if (mRun == Run::Whole)
        mRun = Run::Spoilt;
    if (isRunning() && mApplies)
        return refresh(); // what is applied is what the settings say
    startTimer();
}

void RunControl::settingsMove() {
    if (mTimer.isActive())
        mTimer.start();
}

void RunControl::refreshByItself() {
    if (mWindow.isUserBusy())
        mTimer.start();
    else
        refresh();
}

void RunControl::refresh() {
    if (!mWindow.isOpen())
        return;
    if (isRunning()) {
        mAgain = true;
        return stopRun();
    }
    if (mUpToDate) {
        if (mApplies)
            use();
        return;
    }
    if (!mWindow.prepareRun())
        return;
    mTimer.stop(); // what changed until now is part of this run
    bool isWhole = false;
    {
        const QScopedValueRollback<Run> running(mRun, Run::Whole);
        mWindow.runCore();
        isWhole = mRun == Run::Whole;
    }
    if (mWindow.isOpen()) // what happened meanwhile may have closed it
        ended(isWhole);
}

void RunControl::apply() {
    mApplies = true;
    refresh();
}

void RunControl::applyToTheEnd() {
    apply();
    while (mWindow.isOpen() && mAgain)
        goOn();
}

void RunControl::forget() {
    mApplies = false;
    mAgain = false;
    mTimer.stop();
}

void RunControl::stop() {
    forget();
    stopRun();
}

void RunControl::close() {
    mTimer.stop();
    mGoOnTimer.stop();
    mWaiting.clear();
}

void RunControl::stopRun() {
    if (!isRunning())
        return;
    mRun = Run::Spoilt;
    mWindow.stopCore();
}

void RunControl::whenIdle(const std::function<void()>& action) {
    mWaiting.append(action);
    if (!isRunning())
        return mGoOnTimer.start();
    interrupt();
}

// For what waits.
void RunControl::interrupt() {
    mAgain = mAgain || mRun == Run::Whole;
    stopRun();
}

void RunControl::ended(bool isWhole) {
    mUpToDate = isWhole && mWindow.isRunComplete();
    if (isWhole && !mUpToDate)
        mApplies = false; // it failed: nothing is there to use, and the user chooses what to do
    if (mApplies && mUpToDate)
        use();
    if (!mWindow.isOpen())
        return;
    mAgain = mAgain || mApplies; // the run was not the one whose result is wanted
    mWindow.runEnded();
    if (goesOn())
        mGoOnTimer.start();
}

void RunControl::use() {
    if (!mWindow.useResult())
        mApplies = false;
}

// One thing at a time: each may open a box, close the window or be told of by its signals.
void RunControl::goOn() {
    if (isRunning()) { // begun since
        if (!mWaiting.isEmpty())
            interrupt();
        return;
    }
    if (!mWaiting.isEmpty())
        mWaiting.takeFirst()();
    else if (std::exchange(mAgain, false))
        return refresh();
    if (mWindow.isOpen() && goesOn())
        mGoOnTimer.start();
}

} // namespace orvela
