#include "GUI/Windows/RunControl.h"

#include <QElapsedTimer>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

/// A window without widgets: its runs do what a test has them do in their midst, and its log tells the rest.
class Fake : private RunControl::Window {
public:
    RunControl control{*this};
    QStringList log;
    QList<std::function<void()>> midst; ///< of the runs to come
    bool open = true;
    bool busy = false;
    bool wanted = true;
    bool complete = true;

    QString story() {
        QTest::qWait(20);
        return std::exchange(log, {}).join(' ');
    }

private:
    bool isOpen() const override { return open; }
    bool prepareRun() override {
        EXPECT_FALSE(control.isRunning()) << "a second run on the core";
        log += QStringLiteral("take");
        return true;
    }
    void runCore() override {
        EXPECT_FALSE(std::exchange(mRunning, true)) << "a second run on the core";
        if (!midst.isEmpty())
            midst.takeFirst()();
        mRunning = false;
        log += QStringLiteral("run");
    }
    void stopCore() override {
        EXPECT_TRUE(mRunning);
        log += QStringLiteral("stop");
    }
    bool isRunComplete() const override { return complete; }
    void runEnded() override { log += QStringLiteral("ended"); }
    bool useResult() override {
        log += QStringLiteral("use");
        open = !wanted;
        return wanted;
    }
    bool isUserBusy() const override { return busy; }

    bool mRunning = false;
};

} // namespace

TEST(RunControl, RunsOnceForWhatDidNotChange) {
    Fake window;
    window.control.refresh();
    window.control.refresh();
    EXPECT_EQ(window.story(), "take run ended");
    window.control.apply();
    EXPECT_EQ(window.story(), "use");
    EXPECT_TRUE(window.control.applies());
}

TEST(RunControl, StopsARunThatIsAskedForAgainAndMakesItUp) {
    Fake window;
    window.midst = {[&] { window.control.refresh(); }, [&] { window.control.apply(); }};
    window.control.refresh();
    EXPECT_EQ(window.story(), "take stop run ended take stop run ended take run use");

    Fake failing;
    failing.complete = false;
    failing.midst = {[&] { failing.control.apply(); }, [&] { failing.complete = true; }};
    failing.control.refresh();
    EXPECT_EQ(failing.story(), "take stop run ended take run use") << "nobody wanted the one that failed";

    Fake changed;
    changed.midst = {[&] { changed.control.settingsChanged(); }};
    changed.control.apply();
    EXPECT_EQ(changed.story(), "take stop run ended take run use") << "the settings at OK are what is used";
}

TEST(RunControl, UsesNothingThatWasStoppedFailedOrIsNotWanted) {
    Fake stopped;
    stopped.midst = {[&] { stopped.control.stop(); }};
    stopped.control.apply();
    EXPECT_EQ(stopped.story(), "take stop run ended");
    EXPECT_FALSE(stopped.control.isUpToDate() || stopped.control.applies());

    Fake failed;
    failed.complete = false;
    failed.control.apply();
    EXPECT_EQ(failed.story(), "take run ended");
    EXPECT_FALSE(failed.control.isUpToDate() || failed.control.applies());
    failed.complete = true;
    failed.control.refresh();
    EXPECT_EQ(failed.story(), "take run ended");

    Fake unwanted;
    unwanted.wanted = false;
    unwanted.control.apply();
    EXPECT_EQ(unwanted.story(), "take run use ended");
    unwanted.control.refresh();
    EXPECT_EQ(unwanted.story(), "");
    unwanted.control.apply();
    EXPECT_EQ(unwanted.story(), "use") << "asked again";
}

TEST(RunControl, MakesUpForARunThatOtherThingsStopped) {
    Fake window;
    window.midst = {[&] {
        window.control.whenIdle([&] { window.log += QStringLiteral("first"); });
        window.control.whenIdle([&] { window.log += QStringLiteral("second"); });
    }};
    window.control.refresh();
    EXPECT_EQ(window.story(), "take stop stop run ended first second take run ended");
    window.control.settingsChanged();
    window.control.whenIdle([] {});
    window.midst = {[] { QCoreApplication::processEvents(); }};
    window.control.refresh();
    EXPECT_EQ(window.story(), "take stop run ended take run ended") << "begun before the action was due";
    window.control.whenIdle([&] { window.control.apply(); });
    EXPECT_EQ(window.log.size(), 0) << "not from within a slot";
    EXPECT_EQ(window.story(), "use");
}

TEST(RunControl, DoesNothingMoreOnceTheWindowIsClosed) {
    Fake window;
    window.midst = {[&] {
        window.control.refresh();
        window.control.whenIdle([&] { window.log += QStringLiteral("late"); });
        window.control.stop();
        window.open = false;
        window.control.close();
    }};
    window.control.setAutomatic(true);
    window.control.settingsChanged();
    window.control.refresh();
    EXPECT_EQ(window.story(), "take stop stop stop run");
    window.control.refresh();
    QTest::qWait(1100);
    EXPECT_EQ(window.story(), "");
}

TEST(RunControl, ComesByItselfASecondAfterTheLastChange) {
    Fake window;
    const auto waitForRun = [&window] {
        QElapsedTimer time;
        time.start();
        EXPECT_TRUE(QTest::qWaitFor([&window] { return window.log.contains("run"); }, 4000));
        window.log.clear();
        return time.elapsed();
    };
    window.control.settingsChanged();
    QTest::qWait(1100);
    EXPECT_EQ(window.story(), "") << "not asked to";
    window.control.setAutomatic(true);
    window.control.settingsChanged();
    QTest::qWait(600);
    window.control.settingsMove();
    QTest::qWait(600);
    window.control.settingsChanged();
    EXPECT_GE(waitForRun(), 950);

    window.control.settingsChanged();
    window.busy = true;
    QTest::qWait(1100);
    EXPECT_EQ(window.story(), "") << "a slider is held, or a box is open";
    window.busy = false;
    waitForRun();

    window.control.settingsChanged();
    window.midst = {[&] { window.control.stop(); }};
    window.control.apply();
    EXPECT_EQ(window.story(), "take stop run ended");
    QTest::qWait(1100);
    EXPECT_EQ(window.story(), "") << "what was stopped does not come again";
}
