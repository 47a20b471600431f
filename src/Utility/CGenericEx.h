#pragma once

#include <QByteArray>
#include <QString>

#include <exception>

/// The failure that every layer of the system throws. Constructing one also records it on the process-wide
/// exception stack, so that the entry point can show the innermost cause and log the whole chain; a copy is
/// the same failure and is not recorded. Whoever catches a failure and throws one with a text of its own
/// keeps the cause by std::throw_with_nested.
class CGenericEx : public std::exception {
public:
    /// @param message     what failed, for the user; null counts as empty
    /// @param sourceFile  the raising source; only the text after its last backslash is kept
    /// @param line        source line of the raise
    CGenericEx(const QString& message, const char* sourceFile, int line,
               const char* className = "CGenericEx");
    ~CGenericEx() override;
    CGenericEx(const CGenericEx& other);
    CGenericEx& operator=(const CGenericEx&) = delete;

    /// The message as UTF-8.
    const char* what() const noexcept override { return mUtf8.constData(); }

    const QString& message() const { return mMessage; }
    const QByteArray& className() const { return mClassName; }
    const QByteArray& sourceFile() const { return mSourceFile; }
    int line() const { return mLine; }

private:
    QByteArray mClassName;
    QString mMessage;
    QByteArray mUtf8;
    QByteArray mSourceFile;
    int mLine;
};

/// A failed allocation.
struct COutOfMemoryEx : CGenericEx {
    COutOfMemoryEx(const QString& message, const char* sourceFile, int line);
};

/// A missing or invalid object, or a failed copy.
struct CBadPtrEx : CGenericEx {
    CBadPtrEx(const QString& message, const char* sourceFile, int line);
};

namespace orvela {

/// The message of the failure at the bottom of a chain of nested ones.
QString innermostMessage(const std::exception& failure);

/// True when the failure, or one nested in it, is a failed allocation: std::bad_alloc or COutOfMemoryEx.
bool isOutOfMemory(const std::exception& failure);

/// The process-wide record of every failure raised since it was last cleared, newest first. Raising and
/// catching never trim it. Safe to use from several threads, and before and after the life of static objects.
namespace ExceptionStack {

/// Logs the entries from the newest to the oldest at the error level, then clears the stack if asked to.
void writeToLog(bool clearAfterwards);

void clear();

/// The message of the first failure raised since the last clearing; null when there is none.
QString oldestMessage();

/// The entries as they are logged, newest first.
QStringList entries();

} // namespace ExceptionStack

} // namespace orvela
