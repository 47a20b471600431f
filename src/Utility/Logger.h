#pragma once

#include <QByteArray>

#include <cstdio>
#include <memory>

namespace orvela {

/// Importance of a log line; a line is written when its level is not above the threshold.
enum class LogLevel : int { High = 0, Error = 1, Warning = 2, Info = 3, Debug = 4, User = 5 };

} // namespace orvela

/// Receiver of finished log lines.
class ILogger {
public:
    virtual ~ILogger() = default;
    virtual void write(const QByteArray& line) = 0;
};

/// Writes each line, followed by "\n", to a file and flushes it, so that a crash leaves a readable log.
class CLoggerFile final : public ILogger {
public:
    /// Truncates or creates the file at `path`.
    explicit CLoggerFile(const QByteArray& path);
    void write(const QByteArray& line) override;
    /// False when the file could not be opened.
    bool isOpen() const { return mFile != nullptr; }

private:
    struct Closer {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };
    std::unique_ptr<std::FILE, Closer> mFile;
};

namespace orvela {

/// The process-wide logging core. Every call is safe from any thread and never throws. Formatted messages are
/// cut at 2047 bytes, scope texts and composed lines at 1023.
namespace Log {

/// Writes one line at `level`, indented by the current depth.
void log(LogLevel level, const char* format, ...) __attribute__((format(printf, 2, 3)));

/// Writes "-> " and the text, then increases the indentation depth.
void scopeEntry(LogLevel level, const char* format, ...) __attribute__((format(printf, 2, 3)));

/// Decreases the indentation depth (not below 0), then writes "<- " and the text.
void scopeExit(LogLevel level, const char* format, ...) __attribute__((format(printf, 2, 3)));

/// Lines above this level are dropped. 3 (info) at start.
void setThreshold(LogLevel level);

/// Switches the level prefixes ("Err> " and so on) on or off. Off at start.
void setPrefixes(bool on);

/// Makes `logger` current and the indentation 0, destroying the logger before it; null stops all logging.
void install(std::unique_ptr<ILogger> logger);

/// True when a line at `level` would be written: lets a caller skip the work of listing many values.
bool writes(LogLevel level);

} // namespace Log

/// A scope of the log: its entry when made, its exit when destroyed.
class LogScope {
public:
    /// @param text  outlives it
    LogScope(LogLevel level, const char* text) : mLevel(level), mText(text) {
        Log::scopeEntry(mLevel, "%s", mText);
    }
    ~LogScope() { Log::scopeExit(mLevel, "%s", mText); }
    LogScope(const LogScope&) = delete;
    LogScope& operator=(const LogScope&) = delete;

private:
    LogLevel mLevel;
    const char* mText;
};

/// While it lives, the lines of its thread are indented by a depth of their own, so that runs on several
/// threads do not indent each other's. Elsewhere one depth holds for the whole process.
class LogDepth {
public:
    /// Which depth a thread uses.
    using Binding = int*;

    /// A depth of its own, which starts at the thread's present one.
    LogDepth();
    /// The depth that another thread uses.
    explicit LogDepth(Binding binding);
    ~LogDepth();
    LogDepth(const LogDepth&) = delete;
    LogDepth& operator=(const LogDepth&) = delete;

    /// The calling thread's, to be handed to a thread that works for it.
    static Binding current();

private:
    int mOwn = 0;
    Binding mBefore = nullptr;
};

/// The low 32 bits of an address, as log lines show it.
unsigned logAddress(const void* object);

} // namespace orvela
