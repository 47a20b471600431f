#include "command/Enhancement.h"

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "PluginEntry/CARGBPlanePhotoshop.h"
#include "Utility/CGenericEx.h"
#include "command/TraceFolder.h"
#include "common/ImageHost.h"

#include <algorithm>
#include <exception>

namespace orvela {

namespace {

// The planes of one photograph and what watches the runs over them.
class Run {
public:
    // `result` is the host's result cell.
    Run(ImageHost& host, std::int16_t& result, StopSignals& signals, ProgressLine& progress)
        : mHost(host), mResult(result), mSignals(signals), mProgress(progress),
          mInput(0, 0, QStringLiteral("Input")) {
        const StopAction leave(mSignals, [this] { mSignals.leave(); });
        mInput.FillFrom_Photoshop_Data(&mHost.record(), &mResult);
        mOriginal.emplace(mInput);
        mOutput.emplace(mInput, QStringLiteral("Output"));
    }

    void traceTo(const TraceOptions& trace) { mTrace.emplace(trace.folder, trace.overwrite, mInput); }

    bool enhance(const RunSettings& settings) {
        CThreadedCore_Orvela core(&mInput, &*mOutput);
        if (!execute(core, settings.params))
            return false;
        if (settings.runsFinalTouch) {
            CThreadedCore_FinalTouch touch(&mInput, &*mOutput);
            if (!execute(touch, settings.finalTouchParams))
                return false;
        }
        mOutput->copyPlaneToPS(&mHost.record(), &mResult);
        return true;
    }

private:
    bool execute(CThreadedCore& core, const CUserParamsPhotoshop& params);
    void connect(CThreadedCore& core);

    ImageHost& mHost;
    std::int16_t& mResult;
    StopSignals& mSignals;
    ProgressLine& mProgress;
    CARGBPlanePhotoshop mInput;
    std::optional<CARGBPlaneProxyDirect> mOriginal;
    std::optional<CARGBPlanePhotoshop> mOutput;
    std::optional<TraceFolder> mTrace;
    std::exception_ptr mTraceFailure;
};

// The handlers run on the thread of the run.
void Run::connect(CThreadedCore& core) {
    QObject::connect(&core, &CThreadedCore::percentDone, &core,
                     [this](int value) { mProgress.percent(value); });
    QObject::connect(&core, &CThreadedCore::stepDone, &core,
                     [this, &core](int step, int total, const QString& name) {
                         // More steps are announced than the total that comes with them.
                         const auto steps = static_cast<int>(PipelineTable::mainSteps().size());
                         mProgress.step(step, total > 1 ? std::max(total, steps) : total, name);
                         core.stepHandled();
                     });
    if (!mTrace)
        return;
    core.setObserver([this, &core](const TaskReport& report) {
        if (mTraceFailure)
            return;
        // A failed trace must not look like a failed task.
        try {
            mTrace->taskDone(report, mInput, core.params());
        } catch (...) {
            mTraceFailure = std::current_exception();
            core.stop();
        }
    });
}

bool Run::execute(CThreadedCore& core, const CUserParamsPhotoshop& params) {
    connect(core);
    core.setParams(params);
    {
        const StopAction stopCore(mSignals, [&core] { core.stop(); });
        core.run();
    }
    if (mTraceFailure)
        std::rethrow_exception(mTraceFailure);
    if (mSignals.stopRequested())
        return false;
    if (!core.lastProcessingDone())
        throw EngineFailure("the engine gave up, most likely for want of memory");
    return true;
}

} // namespace

std::optional<Photograph> enhance(Photograph photograph, const RunSettings& settings,
                                  const std::optional<TraceOptions>& trace, StopSignals& signals,
                                  ProgressLine& progress) {
    std::int16_t result = 0;
    try {
        ImageHost host(std::move(photograph));
        Run run(host, result, signals, progress);
        if (trace)
            run.traceTo(*trace);
        if (!run.enhance(settings))
            return std::nullopt;
        return std::move(host.photograph());
    } catch (const CGenericEx&) {
        // The failure itself tells only that the host refused a request.
        if (result == host::MemFullErr)
            throw EngineFailure("not enough memory");
        throw;
    }
}

} // namespace orvela
