#include "Utility/CGenericEx.h"

#include "Utility/Logger.h"

#include <QStringList>

#include <deque>
#include <mutex>
#include <new>

using namespace orvela;

namespace {

struct Record {
    QString message;
    QByteArray sourceFile;
    int line;
    QByteArray className;

    QString text() const {
        return QStringLiteral("%1:%2 %3 %4")
            .arg(QString::fromUtf8(sourceFile), QString::number(line), QString::fromLatin1(className),
                 message);
    }
};

// A failure may still be raised when static objects are gone: the mutex has no destructor to run, and the
// records are made anew when that is needed.
std::mutex gMutex;
std::deque<Record>* gRecords = nullptr;

// The caller holds gMutex.
void dropRecords() {
    delete gRecords;
    gRecords = nullptr;
}

struct RecordsGuard {
    ~RecordsGuard() {
        const std::lock_guard lock(gMutex);
        dropRecords();
    }
};
const RecordsGuard gGuard;

void record(Record entry) {
    const std::lock_guard lock(gMutex);
    if (gRecords == nullptr)
        gRecords = new std::deque<Record>;
    gRecords->push_front(std::move(entry));
}

QByteArray afterLastBackslash(const char* path) {
    const QByteArray text(path);
    return text.mid(text.lastIndexOf('\\') + 1);
}

// Visits the failure and then those nested in it, the innermost last; one that is no std::exception ends the
// chain.
template <typename Visit>
void visitChain(const std::exception& failure, Visit visit) {
    visit(failure);
    const auto* nested = dynamic_cast<const std::nested_exception*>(&failure);
    if (nested == nullptr || nested->nested_ptr() == nullptr)
        return;
    try {
        nested->rethrow_nested();
    } catch (const std::exception& inner) {
        visitChain(inner, visit);
    } catch (...) {
    }
}

} // namespace

CGenericEx::CGenericEx(const QString& message, const char* sourceFile, int line, const char* className)
    : mClassName(className), mMessage(message), mUtf8(message.toUtf8()),
      mSourceFile(afterLastBackslash(sourceFile)), mLine(line) {
    record({mMessage, mSourceFile, mLine, mClassName});
}

CGenericEx::CGenericEx(const CGenericEx& other) = default;
CGenericEx::~CGenericEx() = default;

COutOfMemoryEx::COutOfMemoryEx(const QString& message, const char* sourceFile, int line)
    : CGenericEx(message, sourceFile, line, "COutOfMemoryEx") {}

CBadPtrEx::CBadPtrEx(const QString& message, const char* sourceFile, int line)
    : CGenericEx(message, sourceFile, line, "CBadPtrEx") {}

namespace orvela {

QString innermostMessage(const std::exception& failure) {
    QString message;
    visitChain(failure, [&](const std::exception& each) { message = QString::fromUtf8(each.what()); });
    return message;
}

bool isOutOfMemory(const std::exception& failure) {
    bool found = false;
    visitChain(failure, [&](const std::exception& each) {
        found = found || dynamic_cast<const std::bad_alloc*>(&each) != nullptr ||
                dynamic_cast<const COutOfMemoryEx*>(&each) != nullptr;
    });
    return found;
}

namespace ExceptionStack {

void writeToLog(bool clearAfterwards) {
    Log::scopeEntry(LogLevel::Error, "Exception Stack:");
    for (const QString& entry : entries())
        Log::log(LogLevel::Error, " %s", qUtf8Printable(entry));
    if (clearAfterwards)
        clear();
    Log::scopeExit(LogLevel::Error, "End Stack.");
}

void clear() {
    const std::lock_guard lock(gMutex);
    dropRecords();
}

QString oldestMessage() {
    const std::lock_guard lock(gMutex);
    return gRecords == nullptr ? QString() : gRecords->back().message;
}

QStringList entries() {
    const std::lock_guard lock(gMutex);
    QStringList texts;
    if (gRecords != nullptr)
        for (const Record& entry : *gRecords)
            texts << entry.text();
    return texts;
}

} // namespace ExceptionStack

} // namespace orvela
