#pragma once

#include <QList>
#include <QObject>
#include <QTimer>

#include <functional>

namespace orvela {

/// Decides when the core of a processing window runs.
///
/// A run is made within a call and serves the events of its thread, so that anything here may be called in
/// the middle of one. A core never gets a second run meanwhile: who asks for one stops the first, and the
/// second starts when that has returned. So does everything else that cannot be done beside a run.
class RunControl : public QObject {
    Q_OBJECT

public:
    /// The window, as far as its runs are concerned.
    class Window {
    public:
        virtual ~Window() = default;

        virtual bool isOpen() const = 0;
        /// Takes the settings for the run that comes next; false when there can be none.
        virtual bool prepareRun() = 0;
        /// Runs the core; returns when it has ended.
        virtual void runCore() = 0;
        /// Has the core end its run soon.
        virtual void stopCore() = 0;
        /// Whether the last run reached its end.
        virtual bool isRunComplete() const = 0;
        /// A run has ended, and its result is not to be used, or not yet.
        virtual void runEnded() = 0;
        /// Closes with the result; false when the user does not want it.
        virtual bool useResult() = 0;
        /// Whether something is held or open that no run may come by itself behind.
        virtual bool isUserBusy() const = 0;
    };

    explicit RunControl(Window& window);

    bool isRunning() const { return mRun != Run::None; }
    /// Whether there is a result, and the one that the settings ask for.
    bool isUpToDate() const { return mUpToDate; }
    /// Whether something follows the run that has ended.
    bool goesOn() const { return mAgain || !mWaiting.isEmpty(); }
    /// Whether the result is to be used as soon as it is there, or was.
    bool applies() const { return mApplies; }

    /// Whether runs come by themselves, a second after the last change.
    void setAutomatic(bool automatic);
    /// Has one come so.
    void startTimer();

    /// The settings ask for another result.
    void settingsChanged();
    /// A control moves: a run that is to come by itself waits for the end of the movement.
    void settingsMove();
    /// The last result is of other settings, or of another picture.
    void outdate() { mUpToDate = false; }

    /// Runs the core unless its result is up to date. The result is used when it was asked for.
    void refresh();
    /// Refreshes and uses the result.
    void apply();
    /// The same until nothing is left to be done: for windows whose events nobody serves.
    void applyToTheEnd();
    /// Nothing that was asked for before is wanted any more.
    void forget();
    /// The same, and stops a run.
    void stop();
    /// The window was closed: nothing comes by itself any more.
    void close();

    /// Does something once no run is under way; the run that it stops is made up for. Not at once, since this
    /// may be called from within a slot of what the action deletes.
    void whenIdle(const std::function<void()>& action);

private:
    /// The run under way. One is spoilt when it was stopped, or when the settings changed since they were
    /// taken: its result is not the one that they ask for.
    enum class Run { None, Whole, Spoilt };

    void refreshByItself();
    void stopRun();
    void interrupt();
    void ended(bool isWhole);
    void use();
    void goOn();

    Window& mWindow;
    Run mRun = Run::None;
    bool mAutomatic = false;
    bool mUpToDate = false;
    bool mApplies = false;
    bool mAgain = false;                   ///< once the run that is being stopped has returned
    QList<std::function<void()>> mWaiting; ///< before that
    QTimer mTimer{this};
    QTimer mGoOnTimer{this};
};

} // namespace orvela
