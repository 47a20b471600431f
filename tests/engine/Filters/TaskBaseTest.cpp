#include "Filters/TaskBase.h"

#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "support/LogCapture.h"
#include "support/ScriptedFilter.h"

#include <QStringList>

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using TaskBaseTest = ScriptedFilterTest;

TEST_F(TaskBaseTest, PhasesRunInOrderBetweenTheirLines) {
    LogCapture log;
    EXPECT_TRUE(filter.Apply());
    EXPECT_EQ(filter.outcome(), TaskOutcome::Applied);
    EXPECT_THAT(filter.phases, ElementsAre("pre", "post", "success"));
    ASSERT_EQ(log.lines().size(), 8U);
    EXPECT_EQ(log.lines()[0], "-> PreApply");
    EXPECT_EQ(log.lines()[6], "onSuccess copying from out to in");
}

TEST_F(TaskBaseTest, QuietStopsSkipTheLaterPhases) {
    LogCapture log;
    filter.pre = false;
    EXPECT_FALSE(filter.Apply());
    EXPECT_TRUE(filter.rows.empty());
    EXPECT_EQ(filter.outcome(), TaskOutcome::Skipped);
    EXPECT_TRUE(log.has("<- Task canceled in PreApply."));
    ScriptedFilter late(&params, in.get(), out.get());
    late.post = false;
    EXPECT_FALSE(late.Apply());
    EXPECT_THAT(late.phases, ElementsAre("pre", "post"));
    EXPECT_TRUE(log.has("<- Task canceled in PostApply."));
    expectUntouched();
}

TEST_F(TaskBaseTest, RowRangesOfStartEndAndStep) {
    const std::tuple<unsigned, unsigned, unsigned, std::set<std::uint32_t>> cases[] = {
        {0, 5, 2, {0, 2}},
        {1, 6, 1, {1, 2, 3, 4, 5}},
        {3, 3, 1, {}},
        {3, 2, 1, {}},
        {0, static_cast<unsigned>(-4), 1, {}}};
    for (const auto& [start, end, step, rows] : cases) {
        ScriptedFilter part(&params, in.get(), out.get());
        part.start = start;
        part.end = end;
        part.step = step;
        EXPECT_TRUE(part.Apply());
        EXPECT_EQ(part.rows, rows) << start << ' ' << end;
    }
}

TEST_F(TaskBaseTest, AStepOfNoRowsIsABrokenPromise) {
    filter.end = 5;
    filter.step = 0;
#if defined(QT_NO_DEBUG) && !defined(QT_FORCE_ASSERTS)
    EXPECT_FALSE(filter.Apply());
    EXPECT_EQ(filter.failure().cause, "mVertStep");
#else
    EXPECT_DEATH(filter.Apply(),
                 "TaskBase::DoApplyParallel\\(\\): \"mVertStep\", file Filters/TaskBase, line 100");
#endif
}

TEST_F(TaskBaseTest, FailuresOnWorkersEndThePass) {
    for (const int threads : {1, 2, 7}) {
        RowScheduler scheduler(threads);
        LogCapture log;
        ScriptedFilter failing(&params, in.get(), out.get());
        failing.throwAtRow = 3;
        scheduler.execute([&] { EXPECT_FALSE(failing.Apply()); });
        EXPECT_THAT(failing.phases, ElementsAre("pre"));
        EXPECT_EQ(failing.outcome(), TaskOutcome::Failed);
        EXPECT_EQ(failing.failure().cause, "row 3 is broken");
        EXPECT_TRUE(log.has("<- Unable to complete filter block."));
        expectUntouched();
    }
}

TEST_F(TaskBaseTest, AFailureToRestoreThePictureIsTheTasksFailure) {
    for (const bool quiet : {true, false}) {
        ScriptedFilter failing(&params, in.get(), out.get());
        failing.restores = false;
        failing.post = !quiet;
        failing.throwAtRow = quiet ? -1 : 3;
        EXPECT_NO_THROW(EXPECT_FALSE(failing.Apply()));
        EXPECT_EQ(failing.outcome(), TaskOutcome::Failed);
        EXPECT_TRUE(failing.failure().outOfMemory);
    }
}

TEST_F(TaskBaseTest, StopRequestEndsThePassBeforeAnyLaterRow) {
    params.mProgressCallback = [this](int) { params.mCancelRequested = true; };
    RowScheduler scheduler(1);
    scheduler.execute([&] { EXPECT_FALSE(filter.Apply()); });
    EXPECT_EQ(filter.rows.size(), 1U);
    EXPECT_EQ(filter.outcome(), TaskOutcome::Cancelled);
    EXPECT_EQ(ExceptionStack::entries(), QStringList("Filters/Scripted:7 CGenericEx User canceled."));
    expectUntouched();
}

TEST_F(TaskBaseTest, AStopBeforeThePassLeavesNothingToRestore) {
    params.mCancelRequested = true;
    filter.restores = false;
    EXPECT_FALSE(filter.Apply());
    EXPECT_EQ(filter.outcome(), TaskOutcome::Cancelled);
    EXPECT_EQ(testplanes::bytes(*out), testplanes::bytes(*testplanes::noise(4, 7)));
}

TEST_F(TaskBaseTest, RowsReportTheirPercentage) {
    std::set<int> percents;
    params.mProgressCallback = [&percents](int percent) { percents.insert(percent); };
    RowScheduler scheduler(1);
    scheduler.execute([&] { EXPECT_TRUE(filter.Apply()); });
    // 100 / 7 = 14.2857 in single precision, times 1 to 7.
    EXPECT_THAT(percents, ElementsAre(14, 28, 42, 57, 71, 85, 100));
}

} // namespace
