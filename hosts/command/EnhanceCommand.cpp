#include "command/EnhanceCommand.h"

#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "command/LogFile.h"
#include "command/Messages.h"
#include "command/PhotographBatch.h"
#include "command/Sources.h"
#include "files/Memory.h"
#include "files/TargetFile.h"
#include "run/Enhancement.h"
#include "run/PresetFiles.h"
#include "run/UsageError.h"

#include <malloc.h>

#include <algorithm>
#include <csignal>
#include <iostream>

namespace orvela {

namespace fs = std::filesystem;

namespace {

int threadsOf(const EnhanceOptions& options) {
    return options.threads > 0 ? options.threads : RowScheduler::defaultThreads();
}

// Shows the run's progress, and ends it or the program when a signal arrives: at once as long as nothing is
// begun that would have to end in good order.
class TerminalWatch final : public RunWatch {
public:
    TerminalWatch(StopSignals& signals, ProgressLine& progress) : mSignals(signals), mProgress(progress) {
        mAction.emplace(signals, [&signals] { signals.leave(); });
    }
    void step(int step, int total, const QString& title) override { mProgress.step(step, total, title); }
    void percent(int percent) override { mProgress.percent(percent); }
    void setStop(const std::function<void()>& stop) override {
        mAction.reset();
        if (stop)
            mAction.emplace(mSignals, stop);
    }
    bool stopRequested() const override { return mSignals.stopRequested(); }

private:
    StopSignals& mSignals;
    ProgressLine& mProgress;
    std::optional<StopAction> mAction;
};

class EnhanceBatch final : public PhotographBatch {
public:
    EnhanceBatch(const EnhanceOptions& options, const RunSettings& settings, std::vector<Job> jobs,
                 StopSignals& signals)
        : PhotographBatch({options.targets.folder, reading(options, settings), options.writing, options.quiet,
                           false, false, options.log.has_value()},
                          std::move(jobs), signals),
          mOptions(options), mSettings(settings), mScheduler(options.threads) {}

private:
    void runJob(const Job& job) override {
        mScheduler.execute([&] { PhotographBatch::runJob(job); });
    }
    std::optional<Photograph> work(const Job& job, Photograph photograph) override {
        const std::optional<TraceOptions> trace = traceOf(job, photograph);
        TerminalWatch watch(signals(), progress());
        return enhance(std::move(photograph), mSettings, trace, watch);
    }
    static ReadOptions reading(const EnhanceOptions& options, const RunSettings& settings);
    std::optional<TraceOptions> traceOf(const Job& job, const Photograph& photograph) const;

    const EnhanceOptions& mOptions;
    const RunSettings& mSettings;
    RowScheduler mScheduler;
};

ReadOptions EnhanceBatch::reading(const EnhanceOptions& options, const RunSettings& settings) {
    ReadOptions reading = options.reading;
    const double megapixels = reading.limits.megapixels;
    reading.limits = needsOf(settings, options.trace.has_value(), threadsOf(options));
    reading.limits.megapixels = megapixels;
    return reading;
}

std::optional<TraceOptions> EnhanceBatch::traceOf(const Job& job, const Photograph& photograph) const {
    if (!mOptions.trace)
        return std::nullopt;
    fs::path folder = *mOptions.trace;
    if (jobs().size() > 1)
        folder /= std::to_string(index() + 1) + "-" + job.source.filename().string();
    if (photograph.pages > 1)
        folder /= "page-" + std::to_string(photograph.page + 1);
    return TraceOptions{folder, mOptions.writing.overwrite};
}

// The log and a saved preset must not fall on a photograph, a result or each other.
void refuseOverlap(const EnhanceOptions& options, const std::vector<Job>& jobs) {
    FileSet taken;
    for (const Job& job : jobs) {
        taken.add(job.source);
        taken.add(job.target);
    }
    if (options.savePreset && taken.contains(*options.savePreset))
        throw UsageError(*options.savePreset + ": is a photograph or a result; name another file");
    for (const auto& preset : {options.savePreset, options.settings.preset})
        if (preset)
            taken.add(*preset);
    if (options.log && taken.contains(*options.log))
        throw UsageError(*options.log + ": is a photograph, a result or a preset; name another file");
}

// A pipe is opened once somebody reads it, for which a signal does not wait; a file would be left
// half-written.
void leaving(const std::string& file, StopSignals& signals, const std::function<void()>& write) {
    std::optional<StopAction> leave;
    if (isStream(file))
        leave.emplace(signals, [&signals] { signals.leave(); });
    write();
}

void savePreset(const EnhanceOptions& options, const RunSettings& settings) {
    static_cast<void>(PresetFiles::toWriteInto(*options.savePreset, options.writing.overwrite));
    PresetFiles::write(settings.preset, *options.savePreset, options.writing.overwrite);
}

// A library whose threads cannot be started waits for them for ever, or ends the program.
bool hasRoomToBegin(const EnhanceOptions& options) {
    const std::uint64_t granted = grantedAddresses();
    if (granted == kUnlimited)
        return true;
    ::mallopt(M_ARENA_MAX, 1); // each thread would reserve 64 MB for itself
    const std::uint64_t needed = kLibraryBytes + kBesideBytes + mappedByThreads(threadsOf(options));
    if (needed > granted)
        Messages::tell("not enough memory: the limits of the process leave " + amountOf(granted) + ", " +
                       amountOf(needed) +
                       " are needed to begin; raise them (ulimit -v, ulimit -d) or use fewer --threads");
    return needed <= granted;
}

ExitStatus targetTrouble(const std::string& text) {
    Messages::tell(text);
    return ExitStatus::TargetTrouble;
}

ExitStatus finish(std::optional<LogFile>& log) {
    try {
        if (log)
            log->finish();
        return ExitStatus::Done;
    } catch (const std::exception& error) {
        return targetTrouble(error.what());
    }
}

} // namespace

ExitStatus enhancePhotographs(const EnhanceOptions& options, StopSignals& signals) {
    if (options.photographs.empty() && !options.savePreset)
        throw UsageError("name the photographs to enhance");
    const RunSettings settings = settle(options.settings);
    if (!options.photographs.empty() && !settings.idle.empty())
        throw UsageError(settings.idle);
    const Sources sources = findSources(options.photographs);
    const std::vector<Job> jobs = planTargets(sources.photographs, options.targets);
    refuseOverlap(options, jobs);
    for (const std::string& note : settings.notes)
        Messages::tell(note);
    if (!jobs.empty() && !hasRoomToBegin(options))
        return ExitStatus::OutOfMemory;
    std::signal(SIGPIPE, SIG_IGN); // nobody reads the log any more: no reason to leave the photographs
    std::optional<LogFile> log;
    try {
        if (options.savePreset)
            leaving(*options.savePreset, signals, [&] { savePreset(options, settings); });
        if (options.log)
            leaving(*options.log, signals,
                    [&] { log.emplace(*options.log, options.writing.overwrite, signals.stopRequested()); });
    } catch (const std::runtime_error& error) { // of a preset or of a target
        return targetTrouble(error.what());
    }
    const ExitStatus found = report(sources);
    const ExitStatus done = EnhanceBatch(options, settings, jobs, signals).run();
    const ExitStatus worst = std::max(done, finish(log));
    // A photograph that failed says more than an argument that matched nothing.
    return worst == ExitStatus::Done ? found : worst;
}

} // namespace orvela
