#include "command/EditCommand.h"

#include "command/Messages.h"
#include "command/PhotographBatch.h"
#include "command/Sources.h"
#include "common/FilterProcess.h"
#include "run/UsageError.h"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <cstring>
#include <iostream>
#include <sstream>

namespace orvela {

namespace {

constexpr std::size_t kMostShown = 100000; // bytes that an argument of a program takes

class EditBatch final : public PhotographBatch {
public:
    EditBatch(const EditOptions& options, std::vector<Job> jobs, StopSignals& signals)
        : PhotographBatch({options.targets.folder, reading(options), options.writing, options.quiet, true,
                           options.targets.freeNames},
                          std::move(jobs), signals),
          mTellsCancel(!options.quiet && !options.desktop) {}

    bool wasCancelled() const { return mCancelled; }

private:
    static ReadOptions reading(const EditOptions& options) {
        ReadOptions reading = options.reading;
        const double megapixels = reading.limits.megapixels;
        reading.limits = FilterProcess::needs();
        reading.limits.megapixels = megapixels;
        return reading;
    }

    std::optional<Photograph> work(const Job& job, Photograph photograph) override {
        SharedPicture picture(shapeOf(photograph));
        std::copy(photograph.samples.begin(), photograph.samples.end(), picture.source().begin());
        std::vector<std::uint8_t>().swap(photograph.samples);
        if (!isAccepted(job, picture))
            return std::nullopt;
        photograph.samples.assign(picture.result().begin(), picture.result().end());
        return photograph;
    }

    bool isAccepted(const Job& job, SharedPicture& picture) {
        try {
            progress().step(0, 1, QStringLiteral("In the windows"));
            FilterProcess windows(picture);
            const StopAction end(signals(), [&windows] { windows.kill(); });
            if (windows.wait())
                return true;
        } catch (const FilterFailure& failure) {
            if (!signals().stopRequested())
                throw PhotographError(job.source.string() + ": " + failure.what() + "; nothing was written");
            return false;
        }
        mCancelled = true;
        progress().clear();
        if (mTellsCancel)
            std::cout << Messages::shown(job.source.string()) << ": left as it is" << std::endl;
        return false;
    }

    const bool mTellsCancel;
    bool mCancelled = false;
};

ExitStatus edit(const EditOptions& options, StopSignals& signals) {
    const Sources sources = findSources(options.photographs);
    EditBatch batch(options, planTargets(sources.photographs, options.targets), signals);
    const ExitStatus found = report(sources);
    const ExitStatus done = batch.run();
    if (done != ExitStatus::Done)
        return done;
    return batch.wasCancelled() ? ExitStatus::Cancelled : found;
}

// Shows a window that gives no picture back. @return its exit status
int awaitWindow(const std::vector<std::string>& what, StopSignals& signals) {
    WindowProcess window(what);
    const StopAction end(signals, [&window] { window.kill(); });
    const WindowProcess::End ended = window.wait();
    if (ended.signal != 0 && !signals.stopRequested())
        throw FilterFailure(std::string("the window ended by signal ") + ::strsignal(ended.signal));
    return ended.status;
}

// What the program tells, for who started it without a terminal.
class ToldInWindow {
public:
    ToldInWindow() : mOut(std::cout.rdbuf(mText.rdbuf())), mError(std::cerr.rdbuf(mText.rdbuf())) {}
    ~ToldInWindow() {
        std::cout.rdbuf(mOut);
        std::cerr.rdbuf(mError);
    }
    ToldInWindow(const ToldInWindow&) = delete;
    ToldInWindow& operator=(const ToldInWindow&) = delete;

    void show(ExitStatus status, StopSignals& signals) const {
        if (!mText.view().empty() && !signals.stopRequested())
            awaitWindow({status == ExitStatus::Done ? "tell" : "warn", mText.str().substr(0, kMostShown)},
                        signals);
    }

private:
    std::ostringstream mText;
    std::streambuf* mOut;
    std::streambuf* mError;
};

ExitStatus editFromDesktop(const EditOptions& options, StopSignals& signals) {
    const ToldInWindow told;
    ExitStatus status = ExitStatus::WrongUsage;
    try {
        status = edit(options, signals);
    } catch (const UsageError& error) {
        Messages::tell(error.what());
    } catch (const std::exception& error) {
        Messages::tell(error.what());
        status = ExitStatus::PhotographFailed;
    }
    told.show(status, signals);
    return status;
}

} // namespace

void EditOptions::declare(CLI::App& app) {
    PhotographOptions::declare(app);
    app.add_flag("--desktop", desktop,
                 "for starting without a terminal: what is told appears in a window, and a result whose name "
                 "is taken gets a number");
    app.add_flag("--about", about, "show what the filter tells about itself");
    app.footer(
        "OK in the windows writes the result, which stands beside its photograph as NAME-enhanced.EXT\n"
        "unless -o or -d is given; Cancel leaves it.\n"
        "Exit status: 0 done, 1 a photograph failed, 2 wrong usage, 3 nothing matched, 4 a target that\n"
        "cannot be written, 5 not enough memory, 6 cancelled, 128+n ended by signal n.");
}

ExitStatus editPhotographs(EditOptions options, StopSignals& signals) {
    if (options.about)
        return awaitWindow({"about"}, signals) == 0 ? ExitStatus::Done : ExitStatus::PhotographFailed;
    if (options.photographs.empty())
        throw UsageError("name the photographs to edit");
    if (!options.desktop)
        return edit(options, signals);
    options.targets.freeNames = true;
    return editFromDesktop(options, signals);
}

} // namespace orvela
