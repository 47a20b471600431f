#include "Utility/Logger.h"

#include <atomic>
#include <cstdarg>
#include <cstdint>
#include <mutex>
#include <utility>

using namespace orvela;

namespace {

constexpr std::size_t kMessageSize = 2048;
constexpr std::size_t kLineSize = 1024;
constexpr std::size_t kScopeSize = 1024;

std::mutex gMutex;
ILogger* gLogger = nullptr; // owned; nothing is destroyed behind the back of a late line
std::atomic<bool> gInstalled = false;
std::atomic<int> gThreshold = static_cast<int>(LogLevel::Info);
std::atomic<bool> gPrefixes = false;
int gDepth = 0;
thread_local LogDepth::Binding tDepth = &gDepth;

const char* prefixOf(LogLevel level) {
    static constexpr const char* kPrefixes[] = {"Hgh> ", "Err> ", "Wrn> ", "Ifo> ", "Dbg> ", "Usr> "};
    const int index = static_cast<int>(level);
    return kPrefixes[index < 5 ? index : 5];
}

// The caller holds gMutex.
void writeLine(LogLevel level, const char* text) {
    if (!gLogger || static_cast<int>(level) > gThreshold.load(std::memory_order_relaxed))
        return;
    const QByteArray line = QByteArray(gPrefixes ? prefixOf(level) : "") + QByteArray(*tDepth, '\t') + text;
    gLogger->write(line.left(kLineSize - 1));
}

// A failure while logging must never reach the code that logs.
template <typename Action>
void guarded(Action&& action) noexcept {
    try {
        const std::lock_guard lock(gMutex);
        action();
    } catch (...) { // NOLINT(bugprone-empty-catch): there is nobody to tell
    }
}

// Ends logging when the module is unloaded, or the program ends; lines after that are dropped.
struct LastLogger {
    ~LastLogger() { Log::install(nullptr); }
} const gLastLogger;

} // namespace

CLoggerFile::CLoggerFile(const QByteArray& path) : mFile(std::fopen(path.constData(), "w")) {}

void CLoggerFile::write(const QByteArray& line) {
    if (!mFile)
        return;
    std::fwrite(line.constData(), 1, static_cast<std::size_t>(line.size()), mFile.get());
    std::fputc('\n', mFile.get());
    std::fflush(mFile.get());
}

namespace orvela {

namespace Log {

void log(LogLevel level, const char* format, ...) {
    if (!writes(level))
        return;
    char message[kMessageSize];
    va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(message, sizeof message, format, arguments);
    va_end(arguments);
    guarded([&] { writeLine(level, message); });
}

void scopeEntry(LogLevel level, const char* format, ...) {
    char text[kScopeSize] = "-> ";
    va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(text + 3, sizeof text - 3, format, arguments);
    va_end(arguments);
    guarded([&] { writeLine(level, text); });
    guarded([] { ++*tDepth; });
}

void scopeExit(LogLevel level, const char* format, ...) {
    char text[kScopeSize] = "<- ";
    va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(text + 3, sizeof text - 3, format, arguments);
    va_end(arguments);
    guarded([&] {
        if (*tDepth > 0)
            --*tDepth;
        writeLine(level, text);
    });
}

void setThreshold(LogLevel level) {
    gThreshold = static_cast<int>(level);
}

void setPrefixes(bool on) {
    gPrefixes = on;
}

void install(std::unique_ptr<ILogger> logger) {
    std::unique_ptr<ILogger> before; // destroyed after the lock: it may log
    guarded([&] {
        gInstalled = logger != nullptr;
        gDepth = 0;
        *tDepth = 0;
        before.reset(std::exchange(gLogger, logger.release()));
    });
}

bool writes(LogLevel level) {
    return gInstalled.load(std::memory_order_relaxed) &&
           static_cast<int>(level) <= gThreshold.load(std::memory_order_relaxed);
}

} // namespace Log

unsigned logAddress(const void* object) {
    return static_cast<unsigned>(reinterpret_cast<std::uintptr_t>(object));
}

LogDepth::LogDepth() {
    guarded([this] { mOwn = *tDepth; });
    mBefore = std::exchange(tDepth, &mOwn);
}

LogDepth::LogDepth(Binding binding) : mBefore(std::exchange(tDepth, binding)) {}

LogDepth::~LogDepth() {
    tDepth = mBefore;
}

LogDepth::Binding LogDepth::current() {
    return tDepth;
}

} // namespace orvela
