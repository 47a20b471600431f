#include "command/EnhanceCommand.h"

#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "command/Enhancement.h"
#include "command/LogFile.h"
#include "command/Messages.h"
#include "command/PresetFiles.h"
#include "command/ProgressLine.h"
#include "command/Sources.h"
#include "files/FileFormat.h"
#include "files/Memory.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "files/TargetFile.h"

#include <malloc.h>

#include <algorithm>
#include <csignal>
#include <iostream>

namespace orvela {

namespace fs = std::filesystem;

namespace {

// What enhancing takes of memory for each pixel: the samples as they came and as they become, one channel of
// them on its way, and planes of three colours for what goes in, what comes out, and the host's picture.
constexpr std::uint64_t kSampleCopies = 2;
constexpr std::uint64_t kChannelBytes = 2;
constexpr std::uint64_t kPlanes = 3;
constexpr std::uint64_t kPlaneBytes = 3;

int threadsOf(const EnhanceOptions& options) {
    return options.threads > 0 ? options.threads : RowScheduler::defaultThreads();
}

// The work on all photographs of one command.
class Batch {
public:
    Batch(const EnhanceOptions& options, const RunSettings& settings, std::vector<Job> jobs,
          StopSignals& signals)
        : mOptions(options), mSettings(settings), mJobs(std::move(jobs)), mSignals(signals),
          mScheduler(options.threads), mMapped(mappedByThreads(threadsOf(options))),
          mProgress(static_cast<int>(mJobs.size()), !options.quiet) {}

    ExitStatus run() {
        ExitStatus worst = ExitStatus::Done;
        for (mIndex = 0; mIndex < mJobs.size() && !mSignals.stopRequested(); ++mIndex)
            worst = std::max(worst, runGuarded(mJobs[mIndex]));
        return worst;
    }

private:
    ExitStatus runGuarded(const Job& job);
    void runJob(const Job& job);
    void makeFolder();
    ReadOptions reading() const;
    bool runPage(const Job& job, PhotographReader& reader, PhotographWriter& writer);
    Photograph read(PhotographReader& reader);
    std::optional<TraceOptions> traceOf(const Job& job, const Photograph& photograph) const;
    ExitStatus failed(ExitStatus status, const std::string& text);
    void note(const std::string& text);

    const EnhanceOptions& mOptions;
    const RunSettings& mSettings;
    const std::vector<Job> mJobs;
    StopSignals& mSignals;
    RowScheduler mScheduler;
    const std::uint64_t mMapped; ///< bytes, see ReadLimits
    ProgressLine mProgress;
    std::size_t mIndex = 0;
    std::string mName; ///< of the photograph, and of its page, before what is told about it
};

ExitStatus Batch::failed(ExitStatus status, const std::string& text) {
    note(text);
    return status;
}

void Batch::note(const std::string& text) {
    mProgress.clear();
    Messages::tell(text);
}

ExitStatus Batch::runGuarded(const Job& job) {
    mName = job.source.string() + ": ";
    ExceptionStack::clear(); // of what earlier photographs left
    try {
        mScheduler.execute([&] { runJob(job); });
        return ExitStatus::Done;
    } catch (const StoppedError&) {
        return ExitStatus::Done;
    } catch (const TargetError& error) {
        return failed(ExitStatus::TargetTrouble, error.what());
    } catch (const MemoryError& error) {
        return failed(ExitStatus::OutOfMemory, error.what());
    } catch (const PhotographError& error) {
        return failed(ExitStatus::PhotographFailed, error.what());
    } catch (const EngineFailure& error) {
        return error.isOutOfMemory()
                   ? failed(ExitStatus::OutOfMemory, mName + error.what() + "; " + kMemoryAdvice)
                   : failed(ExitStatus::PhotographFailed, mName + error.what() + "; nothing was written");
    } catch (const std::exception& error) {
        if (isOutOfMemory(error))
            return failed(ExitStatus::OutOfMemory, mName + "not enough memory; " + kMemoryAdvice);
        return failed(ExitStatus::PhotographFailed, mName + innermostMessage(error).toStdString());
    } catch (...) {
        return failed(ExitStatus::PhotographFailed, mName + "failed for an unknown reason; report this");
    }
}

void Batch::runJob(const Job& job) {
    makeFolder();
    WriteOptions writing = mOptions.writing;
    writing.stop = &mSignals.stopRequested();
    checkTargetPath(job.target, job.source, writing.overwrite);
    mProgress.begin(QString::fromStdString(Messages::shown(job.source.filename().string())));
    PhotographReader reader(job.source, reading());
    PhotographWriter writer(job.target, writing);
    for (int page = 0; page < reader.pages(); ++page) {
        mProgress.page(page, reader.pages());
        if (reader.pages() > 1)
            mName = job.source.string() + ": page " + std::to_string(page + 1) + ": ";
        if (!runPage(job, reader, writer))
            return;
    }
    for (const std::string& warning : writer.commit())
        note(warning);
    mProgress.clear();
    if (!mOptions.quiet)
        std::cout << Messages::shown(job.source.string()) << " -> " << Messages::shown(job.target.string())
                  << std::endl;
}

// Enhances the next page; false when a signal ended it.
bool Batch::runPage(const Job& job, PhotographReader& reader, PhotographWriter& writer) {
    // The temporary file of the first pages has to be removed, the log to be finished.
    mSignals.stay(writer.hasBegun() || mOptions.log);
    Photograph photograph = read(reader);
    checkTarget(photograph, job.target, mOptions.writing);
    if (!photograph.copied) {
        const std::optional<TraceOptions> trace = traceOf(job, photograph);
        std::optional<Photograph> result =
            enhance(std::move(photograph), mSettings, trace, mSignals, mProgress);
        if (!result)
            return false;
        photograph = std::move(*result);
    }
    mProgress.step(1, 1, QStringLiteral("Writing"));
    writer.add(photograph);
    return true;
}

// A failure shows when the first target is looked at.
void Batch::makeFolder() {
    std::error_code error;
    if (mOptions.targets.folder)
        fs::create_directories(*mOptions.targets.folder, error);
}

ReadOptions Batch::reading() const {
    // The final touch keeps one more plane, the trace the last picture and the one to compare it with.
    const std::uint64_t planes = kPlanes + (mSettings.runsFinalTouch ? 1 : 0) + (mOptions.trace ? 2 : 0);
    ReadOptions reading = mOptions.reading;
    reading.limits.sampleCopies = kSampleCopies;
    reading.limits.workBytes = kChannelBytes + planes * kPlaneBytes;
    reading.limits.mappedBytes = mMapped;
    return reading;
}

// Reading cannot be stopped half-way, but leaves nothing behind either: a signal ends the program at once.
Photograph Batch::read(PhotographReader& reader) {
    const StopAction leave(mSignals, [this] { mSignals.leave(); });
    return reader.next();
}

std::optional<TraceOptions> Batch::traceOf(const Job& job, const Photograph& photograph) const {
    if (!mOptions.trace)
        return std::nullopt;
    fs::path folder = *mOptions.trace;
    if (mJobs.size() > 1)
        folder /= std::to_string(mIndex + 1) + "-" + job.source.filename().string();
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

ExitStatus report(const Sources& sources) {
    for (const std::string& failure : sources.failures)
        Messages::tell(failure);
    for (const std::string& argument : sources.unmatched)
        Messages::tell(argument + ": no photograph matches");
    if (!sources.failures.empty())
        return ExitStatus::PhotographFailed;
    return sources.unmatched.empty() ? ExitStatus::Done : ExitStatus::NothingMatched;
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
    const ExitStatus done = Batch(options, settings, jobs, signals).run();
    const ExitStatus worst = std::max(done, finish(log));
    // A photograph that failed says more than an argument that matched nothing.
    return worst == ExitStatus::Done ? found : worst;
}

} // namespace orvela
