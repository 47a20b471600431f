#include "run/Enhancement.h"

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "PluginEntry/Exchange/PictureSession.h"
#include "Utility/CGenericEx.h"
#include "common/ImageHost.h"
#include "files/Memory.h"
#include "run/TraceFolder.h"

#include <algorithm>
#include <exception>

namespace orvela {

namespace {

// What enhancing takes of memory for each pixel: the samples as they came and as they become, one channel of
// them on its way, and planes of three colours for what goes in, what comes out, and the host's picture.
constexpr std::uint64_t kSampleCopies = 2;
constexpr std::uint64_t kChannelBytes = 2;
constexpr std::uint64_t kPlanes = 3;
constexpr std::uint64_t kPlaneBytes = 3;

// The runs over one photograph and what watches them.
class Run {
public:
    Run(PictureSession& session, RunWatch& watch) : mSession(session), mWatch(watch) {}

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
    RunWatch& mWatch;
    std::optional<TraceFolder> mTrace;
    std::exception_ptr mTraceFailure;
};

// Lets a core be stopped while it runs.
class Stoppable {
public:
    Stoppable(RunWatch& watch, CThreadedCore& core) : mWatch(watch) {
        mWatch.setStop([&core] { core.stop(); });
    }
    ~Stoppable() { mWatch.setStop(nullptr); }
    Stoppable(const Stoppable&) = delete;
    Stoppable& operator=(const Stoppable&) = delete;

private:
    RunWatch& mWatch;
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
    QObject::connect(&core, &CThreadedCore::percentDone, &core, [this](int value) { mWatch.percent(value); });
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [this, &core](int step, int total) {
        // More steps are announced than the total that comes with them.
        const auto steps = static_cast<int>(PipelineTable::mainSteps().size());
        mWatch.step(step, total > 1 ? std::max(total, steps) : total, QString::fromUtf8(core.stepTitle()));
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
        const Stoppable stoppable(mWatch,
                                  core); // after the parameters are set, which forgets an earlier stop
        core.run();
    }
    if (mTraceFailure)
        std::rethrow_exception(mTraceFailure);
    if (mWatch.stopRequested())
        return false;
    checkOutcome(core);
    return true;
}

} // namespace

ReadLimits needsOf(const RunSettings& settings, bool traced, int threads) {
    // The final touch keeps one more plane, the trace the last picture and the one to compare it with.
    const std::uint64_t planes = kPlanes + (settings.runsFinalTouch ? 1 : 0) + (traced ? 2 : 0);
    ReadLimits needs;
    needs.sampleCopies = kSampleCopies;
    needs.workBytes = kChannelBytes + planes * kPlaneBytes;
    needs.mappedBytes = mappedByThreads(threads);
    return needs;
}

std::optional<Photograph> enhance(Photograph photograph, const RunSettings& settings,
                                  const std::optional<TraceOptions>& trace, RunWatch& watch) {
    std::int16_t result = 0;
    try {
        Photograph picture = photograph;
        ImageHost host(shapeOf(photograph), photograph.samples, picture.samples);
        PictureSession session(&host.record(), &result);
        watch.setStop(nullptr);
        Run run(session, watch);
        if (trace)
            run.traceTo(*trace);
        if (!run.enhance(settings))
            return std::nullopt;
        session.writeBack();
        return picture;
    } catch (const CGenericEx&) {
        // The failure itself tells only that the host refused a request.
        if (result == host::MemFullErr)
            throw EngineFailure("not enough memory", true);
        throw;
    }
}

} // namespace orvela
