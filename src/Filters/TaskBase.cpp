#include "Filters/TaskBase.h"

#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"
#include "Utility/RowScheduler.h"

#include <QElapsedTimer>

using namespace orvela;

namespace {

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

} // namespace

bool TaskBase::Apply() {
    try {
        if (runPhases())
            return true;
    } catch (...) {
        Log::scopeExit(LogLevel::Error, "Unable to complete filter block.");
    }
    onStopped();
    return false;
}

bool TaskBase::runPhases() {
    const PhaseTimer pre("PreApply");
    if (!PreApply()) {
        Log::scopeExit(LogLevel::Debug, "Task canceled in PreApply.");
        return false;
    }
    pre.done();

    const PhaseTimer pass("Pre DoApplyParallel");
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

void TaskBase::ApplyRow(std::uint32_t) {}

bool TaskBase::DoApplyParallel() {
    Q_ASSERT_X(mVertStep != 0, "TaskBase::DoApplyParallel()", "mVertStep");
    if (mVertEnd <= mVertStart || static_cast<std::int32_t>(mVertEnd) < 0)
        return true;
    const std::uint32_t count = (mVertEnd - mVertStart) / mVertStep;
    orvela::forEachRange(mVertStart, mVertStart + count, 1, [this](unsigned first, unsigned last) {
        for (unsigned i = first; i < last; ++i)
            ApplyRow(i * mVertStep);
    });
    return true;
}

void beginRow(const CUserParams& params, const CARGBPlane& inPlane, std::uint32_t row, const char* source,
              int line) {
    if (params.mCancelRequested)
        throw CGenericEx(QStringLiteral("User canceled."), source, line);
    if (params.mProgressCallback) {
        const float perRow = 100.0F / static_cast<float>(inPlane.height());
        params.mProgressCallback(static_cast<std::int32_t>(perRow * static_cast<float>(row + 1)));
    }
}
