#include "Utility/CGenericEx.h"

#include "Utility/Logger.h"

#include <QStringList>

#include <deque>
#include <mutex>

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

std::mutex gMutex;

std::deque<Record>& records() {
    static std::deque<Record> stack;
    return stack;
}

QByteArray afterLastBackslash(const char* path) {
    const QByteArray text(path);
    return text.mid(text.lastIndexOf('\\') + 1);
}

} // namespace

CGenericEx::CGenericEx(const QString& message, const char* sourceFile, int line, const char* className)
    : mClassName(className), mMessage(message), mSourceFile(afterLastBackslash(sourceFile)), mLine(line) {
    const std::lock_guard lock(gMutex);
    records().push_front({mMessage, mSourceFile, mLine, mClassName});
}

CGenericEx::CGenericEx(const CGenericEx& other) = default;
CGenericEx::~CGenericEx() = default;

COutOfMemoryEx::COutOfMemoryEx(const QString& message, const char* sourceFile, int line)
    : CGenericEx(message, sourceFile, line, "COutOfMemoryEx") {}

CBadPtrEx::CBadPtrEx(const QString& message, const char* sourceFile, int line)
    : CGenericEx(message, sourceFile, line, "CBadPtrEx") {}

namespace orvela {

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
    records().clear();
}

QString oldestMessage() {
    const std::lock_guard lock(gMutex);
    return records().empty() ? QString() : records().back().message;
}

QStringList entries() {
    const std::lock_guard lock(gMutex);
    QStringList texts;
    for (const Record& record : records())
        texts << record.text();
    return texts;
}

} // namespace ExceptionStack

} // namespace orvela
