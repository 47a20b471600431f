#include "command/PhotographBatch.h"

#include "Utility/CGenericEx.h"
#include "command/Messages.h"
#include "files/FileFormat.h"
#include "files/Memory.h"
#include "files/TargetFile.h"
#include "run/Enhancement.h"

#include <algorithm>
#include <iostream>

namespace orvela {

namespace fs = std::filesystem;

PhotographBatch::PhotographBatch(BatchOptions options, std::vector<Job> jobs, StopSignals& signals)
    : mOptions(std::move(options)), mJobs(std::move(jobs)), mSignals(signals),
      mProgress(static_cast<int>(mJobs.size()), !mOptions.quiet) {}

ExitStatus PhotographBatch::run() {
    ExitStatus worst = ExitStatus::Done;
    for (mIndex = 0; mIndex < mJobs.size() && !mSignals.stopRequested(); ++mIndex)
        worst = std::max(worst, runGuarded(mJobs[mIndex]));
    return worst;
}

ExitStatus PhotographBatch::failed(ExitStatus status, const std::string& text) {
    note(text);
    return status;
}

void PhotographBatch::note(const std::string& text) {
    mProgress.clear();
    Messages::tell(text);
}

ExitStatus PhotographBatch::runGuarded(const Job& job) {
    mName = job.source.string() + ": ";
    ExceptionStack::clear(); // of what earlier photographs left
    try {
        runJob(job);
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

void PhotographBatch::runJob(const Job& job) {
    makeFolder();
    WriteOptions writing = mOptions.writing;
    writing.stop = &mSignals.stopRequested();
    checkTargetPath(job.target, job.source, writing.overwrite);
    mProgress.begin(QString::fromStdString(Messages::shown(job.source.filename().string())));
    PhotographReader reader(job.source, mOptions.reading);
    try {
        PhotographWriter writer(job.target, writing);
        runPages(job, reader, writer);
    } catch (const StoppedError&) {
        throw;
    } catch (...) {
        if (mUnwritten)
            keepElsewhere(job);
        throw;
    }
}

void PhotographBatch::runPages(const Job& job, PhotographReader& reader, PhotographWriter& writer) {
    mUnwritten.reset();
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
    mUnwritten.reset();
}

// Works on the next page; false when there is no result.
bool PhotographBatch::runPage(const Job& job, PhotographReader& reader, PhotographWriter& writer) {
    // The temporary file of the first pages has to be removed, the log to be finished.
    mSignals.stay(writer.hasBegun() || mOptions.endsInOrder);
    Photograph photograph = read(reader);
    checkTarget(photograph, job.target, mOptions.writing);
    if (!photograph.copied) {
        std::optional<Photograph> result = work(job, std::move(photograph));
        if (!result)
            return false;
        photograph = std::move(*result);
    }
    mProgress.step(1, 1, QStringLiteral("Writing"));
    if (!mOptions.keepsResults || reader.pages() > 1) {
        writer.add(photograph);
        return true;
    }
    mUnwritten = std::move(photograph);
    writer.add(*mUnwritten);
    return true;
}

// The failure that is being handled goes on, whether this succeeds or not.
void PhotographBatch::keepElsewhere(const Job& job) {
    std::error_code none;
    std::vector<fs::path> folders = {fs::temp_directory_path(none), "/tmp", "/var/tmp"};
    if (mOptions.freeNames)
        folders.insert(folders.begin(), job.target.parent_path());
    for (const fs::path& folder : folders) {
        const fs::path kept = freeName(folder / job.target.filename());
        try {
            writePhotograph(*mUnwritten, kept, {});
            note(mName + "the result is kept as");
            return note(kept.string());
        } catch (const std::exception&) { // then the next one
        }
    }
    note(mName + "the result is lost: no folder for temporary files takes it");
}

// A failure shows when the first target is looked at.
void PhotographBatch::makeFolder() {
    std::error_code error;
    if (mOptions.folder)
        fs::create_directories(*mOptions.folder, error);
}

// Reading cannot be stopped half-way, but leaves nothing behind either: a signal ends the program at once.
Photograph PhotographBatch::read(PhotographReader& reader) {
    const StopAction leave(mSignals, [this] { mSignals.leave(); });
    return reader.next();
}

} // namespace orvela
