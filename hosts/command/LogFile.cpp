#include "command/LogFile.h"

#include "Utility/Logger.h"

namespace orvela {

namespace {

namespace fs = std::filesystem;

fs::path checked(const fs::path& path, bool overwrite) {
    if (!isStream(path))
        checkTargetPath(path, {}, overwrite);
    return linkedFile(path);
}

} // namespace

// The logging core calls it with one line at a time, and forgets what it throws.
class LogFile::Lines final : public ILogger {
public:
    explicit Lines(LogFile& log) : mLog(log) {}

    void write(const QByteArray& line) override {
        if (mLog.mFailure)
            return;
        try {
            mLog.mFile.write((line + '\n').toStdString(), mLog.mStop);
        } catch (const StoppedError&) { // nobody reads the pipe: the rest is left out
        } catch (...) {
            mLog.mFailure = std::current_exception();
        }
    }

private:
    LogFile& mLog;
};

LogFile::LogFile(const fs::path& path, bool overwrite, const std::atomic<bool>& stop)
    : mFile(checked(path, overwrite)), mOverwrite(overwrite), mStop(isStream(path) ? &stop : nullptr) {
    Log::setThreshold(LogLevel::Debug);
    Log::install(std::make_unique<Lines>(*this));
}

LogFile::~LogFile() {
    Log::install(nullptr);
}

void LogFile::finish() {
    Log::install(nullptr);
    if (mFailure)
        std::rethrow_exception(mFailure);
    mFile.commit(mOverwrite);
}

} // namespace orvela
