#include "command/Enhancement.h"

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "PluginEntry/PictureSession.h"
#include "Utility/CGenericEx.h"
#include "command/TraceFolder.h"
#include "common/ImageHost.h"

#include <algorithm>
#include <exception>

namespace orvela {

namespace {

// The runs over one photograph and what watches them.
class Run {
public:
    Run(PictureSession& session, StopSignals& signals, ProgressLine& progress)
        : mSession(session), mSignals(signals), mProgress(progress) {}

    void traceTo(const TraceOptions& trace) {
        mTrace.emplace(trace.folder, trace.overwrite, mSession.input());
    }

    bool enhance(const RunSettings& settings) {
        CThreadedCore_Orvela core(&mSession.input(), &mSession.output());
        if (!execute(core, settings.params))
            return false;
        if (!settings.runsFinalTouch)
            return true;
        CThreadedCore_FinalTouch touch(&mSession.input(), &mSession.output());
        return execute(touch, settings.finalTouchParams);
    }

private:
    bool execute(CThreadedCore& core, const CUserParamsPhotoshop& params);
    void connect(CThreadedCore& core);

    PictureSession& mSession;
    StopSignals& mSignals;
    ProgressLine& mProgress;
    std::optional<TraceFolder> mTrace;
    std::exception_ptr mTraceFailure;
};

// A step that failed leaves the picture without it: a result that nobody asked for.
void checkOutcome(const CThreadedCore& core) {
    if (!core.lastProcessingDone())
        throw EngineFailure("the run failed: " + core.failure().cause.toStdString(),
                            core.failure().outOfMemory);
    for (const TaskReport& report : core.reports())
        if (report.outcome == TaskOutcome::Failed)
            throw EngineFailure(std::string(report.name) + " failed: " + report.failure.cause.toStdString(),
                                report.failure.outOfMemory);
}

// The handlers run on the thread of the run.
void Run::connect(CThreadedCore& core) {
    QObject::connect(&core, &CThreadedCore::percentDone, &core,
                     [this](int value) { mProgress.percent(value); });
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [this, &core](int step, int total) {
        // More steps are announced than the total that comes with them.
        const auto steps = static_cast<int>(PipelineTable::mainSteps().size());
        mProgress.step(step, total > 1 ? std::max(total, steps) : total, QString::fromUtf8(core.stepTitle()));
        core.stepHandled();
    });
    if (!mTrace)
        return;
    core.setObserver([this, &core](const TaskReport& report) {
        if (mTraceFailure)
            return;
        // A failed trace must not look like a failed task.
        try {
            mTrace->taskDone(report, core);
        } catch (...) {
            mTraceFailure = std::current_exception();
            core.stop();
        }
    });
}

bool Run::execute(CThreadedCore& core, const CUserParamsPhotoshop& params) {
    connect(core);
    mSession.prepare(core, params);
    {
        // After the parameters are set, which forgets an earlier stop.
        const StopAction stopCore(mSignals, [&core] { core.stop(); });
        core.run();
    }
    if (mTraceFailure)
        std::rethrow_exception(mTraceFailure);
    if (mSignals.stopRequested())
        return false;
    checkOutcome(core);
    return true;
}

} // namespace

std::optional<Photograph> enhance(Photograph photograph, const RunSettings& settings,
                                  const std::optional<TraceOptions>& trace, StopSignals& signals,
                                  ProgressLine& progress) {
    std::int16_t result = 0;
    try {
        ImageHost host(std::move(photograph));
        std::optional<StopAction> leave(std::in_place, signals, [&signals] { signals.leave(); });
        PictureSession session(&host.record(), &result);
        leave.reset();
        Run run(session, signals, progress);
        if (trace)
            run.traceTo(*trace);
        if (!run.enhance(settings))
            return std::nullopt;
        session.writeBack();
        return std::move(host.photograph());
    } catch (const CGenericEx&) {
        // The failure itself tells only that the host refused a request.
        if (result == host::MemFullErr)
            throw EngineFailure("not enough memory", true);
        throw;
    }
}

} // namespace orvela
