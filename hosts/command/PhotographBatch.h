#pragma once

#include "command/ExitStatus.h"
#include "command/ProgressLine.h"
#include "command/StopSignals.h"
#include "command/Targets.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"

namespace orvela {

/// What the work on photographs has in common, whatever is done with them.
struct BatchOptions {
    std::optional<std::filesystem::path> folder; ///< made when missing
    ReadOptions reading;
    WriteOptions writing;
    bool quiet = false;        ///< no progress and no results, only errors
    bool keepsResults = false; ///< work that cannot be done again: the result of a photograph of one page
                               ///< that cannot be written goes elsewhere
    bool freeNames = false;    ///< elsewhere is first of all a name with a number
    bool endsInOrder = false;  ///< a signal must not end the program at once, whatever was begun
};

/// The work on all photographs of one command, one after the other, page by page; a failed one does not keep
/// the others from being done. Subclasses say what it is.
class PhotographBatch {
public:
    PhotographBatch(BatchOptions options, std::vector<Job> jobs, StopSignals& signals);
    virtual ~PhotographBatch() = default;
    PhotographBatch(const PhotographBatch&) = delete;
    PhotographBatch& operator=(const PhotographBatch&) = delete;

    /// @return the highest status of all photographs
    ExitStatus run();

protected:
    /// Works on one photograph and writes the result.
    virtual void runJob(const Job& job);

    /// Makes a result of a page; none when it was stopped or is not wanted, and nothing is written.
    virtual std::optional<Photograph> work(const Job& job, Photograph photograph) = 0;

    const std::vector<Job>& jobs() const { return mJobs; }
    std::size_t index() const { return mIndex; } ///< of the present job
    StopSignals& signals() { return mSignals; }
    ProgressLine& progress() { return mProgress; }

    /// Tells something about the present photograph.
    void note(const std::string& text);

private:
    ExitStatus runGuarded(const Job& job);
    ExitStatus failed(ExitStatus status, const std::string& text);
    void makeFolder();
    void runPages(const Job& job, PhotographReader& reader, PhotographWriter& writer);
    void keepElsewhere(const Job& job);
    bool runPage(const Job& job, PhotographReader& reader, PhotographWriter& writer);
    Photograph read(PhotographReader& reader);

    const BatchOptions mOptions;
    const std::vector<Job> mJobs;
    StopSignals& mSignals;
    ProgressLine mProgress;
    std::size_t mIndex = 0;
    std::optional<Photograph> mUnwritten; ///< the only page of a photograph whose target is not there yet
    std::string mName; ///< of the photograph, and of its page, before what is told about it
};

} // namespace orvela
