#include "Filters/TaskBase.h"

#include "Filters/MeasurementTape.h"
#include "Utility/Assertion.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"
#include "Utility/RowScheduler.h"

#include <QElapsedTimer>

#include <new>

using namespace orvela;

namespace {

// Rows that one thread works on before it takes others: enough for kernels that share work between
// neighbouring rows, few enough to keep all processors busy.
constexpr unsigned kBandRows = 16;

struct CanceledEx final : CGenericEx {
    CanceledEx(const char* source, int line) : CGenericEx(QStringLiteral("User canceled."), source, line) {}
};

// Times one phase between a scope entry and the matching exit of the log.
class PhaseTimer {
public:
    explicit PhaseTimer(const char* phase) {
        Log::scopeEntry(LogLevel::Debug, "%s", phase);
        mTimer.start();
    }
    void done() const { Log::scopeExit(LogLevel::Debug, "Done in %d ms", elapsed()); }
    int elapsed() const { return static_cast<int>(mTimer.elapsed()); }

private:
    QElapsedTimer mTimer;
};

void logText(const char* text) {
    if (text)
        Log::log(LogLevel::Debug, "%s", text);
}

} // namespace

TaskBase::TaskBase(const RunContext& context, CUserParams* params, CARGBPlane* inPlane)
    : mContext(context), mParams(params), mInPlane(inPlane),
      mVertEnd(inPlane ? static_cast<std::uint32_t>(inPlane->height()) : 0) {}

void TaskBase::measured(const std::function<void()>& measure) {
    MeasurementTape* tape = mContext.tape;
    if (mContext.playsTape && tape->play(*mParams))
        return;
    measure();
    if (tape && !mContext.playsTape)
        tape->record(*mParams);
}

bool TaskBase::measured(std::span<float> numbers) {
    MeasurementTape* tape = mContext.tape;
    if (mContext.playsTape)
        return tape->play(numbers);
    if (tape)
        tape->record(numbers);
    return true;
}

std::int32_t TaskBase::picturePixels() const {
    return mContext.playsTape ? mContext.tape->picturePixels() : mInPlane->pixelCount();
}

bool TaskBase::Apply() {
    guarded([this] { return runPhases() ? TaskOutcome::Applied : TaskOutcome::Skipped; });
    if (mOutcome != TaskOutcome::Applied && mPassBegun)
        restore();
    return mOutcome == TaskOutcome::Applied;
}

void TaskBase::guarded(const std::function<TaskOutcome()>& action) {
    try {
        mOutcome = action();
        return;
    } catch (const CanceledEx&) {
        setOutcome(TaskOutcome::Cancelled);
    } catch (...) {
        setOutcome(TaskOutcome::Failed, Failure::current());
    }
    Log::scopeExit(LogLevel::Error, "Unable to complete filter block.");
}

void TaskBase::setOutcome(TaskOutcome outcome, const Failure& failure) {
    mOutcome = outcome;
    mFailure = failure;
}

void TaskBase::restore() {
    try {
        onStopped();
    } catch (...) {
        setOutcome(TaskOutcome::Failed, Failure::current());
    }
}

bool TaskBase::runPhases() {
    const PhaseTimer pre("PreApply");
    if (!PreApply()) {
        Log::scopeExit(LogLevel::Debug, "Task canceled in PreApply.");
        return false;
    }
    pre.done();

    const PhaseTimer pass("Pre DoApplyParallel");
    testStop(); // before a pass that would have to be undone
    mPassBegun = true;
    if (!DoApplyParallel()) {
        Log::scopeExit(LogLevel::Debug, "Task canceled in DoApplyParallel.");
        return false;
    }
    pass.done();

    const PhaseTimer post("Pre PostApply");
    if (!PostApply()) {
        Log::scopeExit(LogLevel::Debug, "Task canceled in PostApply.");
        return false;
    }
    post.done();

    QElapsedTimer success;
    success.start();
    onSuccess();
    Log::log(LogLevel::Debug, "onSuccess finished in %d ms", static_cast<int>(success.elapsed()));
    return true;
}

bool TaskBase::PreApply() {
    const TaskDescription& texts = description();
    logPlanes(texts.start);
    if (!applies())
        return false;
    logPlanes(texts.opening);
    logText(texts.matched);
    setUp();
    return true;
}

bool TaskBase::PostApply() {
    complete();
    logText(description().completion);
    return true;
}

void TaskBase::logPlanes(const char* text) const {
    if (text)
        Log::log(LogLevel::Debug, text, logAddress(mInPlane.get()), logAddress(outPlane()));
}

void TaskBase::ApplyRow(std::uint32_t) {}

void TaskBase::ApplyBand(const RowBand& band) {
    for (const std::uint32_t row : band)
        ApplyRow(row);
}

bool TaskBase::DoApplyParallel() {
    require(mVertStep != 0, "TaskBase::DoApplyParallel()", "mVertStep", "Filters/TaskBase", 100);
    onPass();
    forEachRange(mVertStart, passEnd(), kBandRows,
                 [this](unsigned first, unsigned last) { ApplyBand(RowBand(*this, first, last)); });
    return true;
}

std::uint32_t TaskBase::passEnd() const {
    const bool empty = mVertEnd <= mVertStart || static_cast<std::int32_t>(mVertEnd) < 0;
    return empty ? mVertStart : mVertStart + (mVertEnd - mVertStart) / mVertStep;
}

const TaskDescription& TaskBase::description() const {
    static constexpr TaskDescription kNone;
    return kNone;
}

void TaskBase::testStop() const {
    if (const TaskDescription& own = description(); own.testsStop && mParams->mCancelRequested)
        throw CanceledEx(own.source, own.line);
}

std::uint32_t TaskBase::enterRow(std::uint32_t index) {
    const std::uint32_t row = index * mVertStep;
    testStop();
    if (!description().testsStop) {
        if (mContext.onSilentRow)
            mContext.onSilentRow();
    } else if (mParams->mProgressCallback) {
        const float perRow = 100.0F / static_cast<float>(mInPlane->height());
        mParams->mProgressCallback(static_cast<std::int32_t>(perRow * static_cast<float>(row + 1)));
    }
    onRow(row);
    return row;
}

Failure Failure::current() noexcept {
    try {
        try {
            throw;
        } catch (const std::exception& failure) {
            return {innermostMessage(failure), isOutOfMemory(failure)};
        }
    } catch (const std::bad_alloc&) {
        return {{}, true};
    } catch (...) {
        return {QStringLiteral(QT_TRANSLATE_NOOP("Failure", "unknown error")), false};
    }
}

std::uint32_t RowBand::enter(std::uint32_t index) const {
    return mTask.enterRow(index);
}
