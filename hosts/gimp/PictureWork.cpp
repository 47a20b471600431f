#include "gimp/PictureWork.h"

#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "common/FilterProcess.h"
#include "files/Memory.h"
#include "run/Enhancement.h"
#include "run/PresetFiles.h"
#include "run/UsageError.h"

#include <QCoreApplication>

#include <unistd.h>

#include <algorithm>
#include <sstream>

namespace orvela {

namespace {

// Tells how far a run is, in steps that can be seen. It is stopped by ending the process.
class ReportedRun final : public RunWatch {
public:
    explicit ReportedRun(const Progress& progress) : mProgress(progress) {}

    void step(int step, int total, const QString& title) override {
        mStep = step;
        mTotal = std::max(total, 1);
        mTitle = title.toStdString();
        mProgress(fraction(0), mTitle);
    }
    void percent(int percent) override {
        if (fraction(percent) < mTold + kSeen)
            return;
        mTold = fraction(percent);
        mProgress(mTold, mTitle);
    }
    void setStop(const std::function<void()>&) override {}
    bool stopRequested() const override { return false; }

private:
    static constexpr double kSeen = 0.01;

    double fraction(int percent) const { return std::min((mStep + percent / 100.0) / mTotal, 1.0); }

    const Progress& mProgress;
    int mStep = 0;
    int mTotal = 1;
    double mTold = 0;
    std::string mTitle;
};

// A program that the windows start, such as a browser, must not keep what this one has open.
void keepDescriptors() {
    constexpr unsigned kFirst = STDERR_FILENO + 1;
    ::close_range(kFirst, ~0U, CLOSE_RANGE_CLOEXEC);
}

std::optional<Photograph> runWindows(Photograph photograph, std::uint64_t hostWindow) {
    keepDescriptors();
    SharedPicture picture(shapeOf(photograph));
    picture.head().hostWindow = hostWindow;
    std::copy(photograph.samples.begin(), photograph.samples.end(), picture.source().begin());
    if (!FilterProcess(picture).wait())
        return std::nullopt;
    std::copy(picture.result().begin(), picture.result().end(), photograph.samples.begin());
    return photograph;
}

PictureWork workBy(const RunSettings& settings) {
    PictureWork work;
    work.needs = needsOf(settings, false, RowScheduler::defaultThreads());
    work.notes = settings.notes;
    work.run = [settings](Photograph photograph, const Progress& progress) {
        int none = 0;
        const QCoreApplication application(none, nullptr);
        ReportedRun watch(progress);
        return enhance(std::move(photograph), settings, std::nullopt, watch);
    };
    return work;
}

std::optional<std::string> textIn(const std::string& text) {
    return text.empty() ? std::nullopt : std::optional(text);
}

// What is wrong with a preset is what is wrong with the arguments.
RunSettings settledBy(const std::function<RunSettings()>& settle) {
    try {
        PresetFiles::checkStore();
        return settle();
    } catch (const PresetError& error) {
        throw UsageError(error.what());
    }
}

} // namespace

PictureWork workByWindows(std::uint64_t hostWindow) {
    PictureWork work;
    work.needs = FilterProcess::needs();
    work.run = [hostWindow](Photograph photograph, const Progress&) {
        return runWindows(std::move(photograph), hostWindow);
    };
    return work;
}

PictureWork workBySettings(const GivenSettings& given) {
    SettingOptions options;
    options.mode = textIn(given.mode);
    options.preset = textIn(given.preset);
    std::istringstream fields(given.fields);
    for (std::string field; fields >> field;)
        options.fields.push_back(field);
    RunSettings run = settledBy([&options] { return settle(options); });
    if (!run.idle.empty())
        throw UsageError("nothing is switched on, so nothing would change; give settings such as "
                         "SaturationValue=640,on or another mode");
    return workBy(run);
}

PictureWork workByLastSettings() {
    return workBy(settledBy(settleLast));
}

std::string failureText(const std::exception& failure) {
    const auto* engine = dynamic_cast<const EngineFailure*>(&failure);
    if (isOutOfMemory(failure) || (engine && engine->isOutOfMemory()))
        return std::string("not enough memory; ") + kMemoryAdvice;
    return innermostMessage(failure).toStdString();
}

} // namespace orvela
