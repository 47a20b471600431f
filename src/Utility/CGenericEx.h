#pragma once

#include <QByteArray>
#include <QString>

/// The failure that every layer of the system throws. Constructing one also records it on the process-wide
/// exception stack, so that the entry point can show the innermost cause and log the whole chain.
class CGenericEx {
public:
    /// @param message     what failed, for the user; null counts as empty
    /// @param sourceFile  the raising source; only the text after its last backslash is kept
    /// @param line        source line of the raise
    CGenericEx(const QString& message, const char* sourceFile, int line,
               const char* className = "CGenericEx");
    virtual ~CGenericEx();
    CGenericEx(const CGenericEx& other);
    CGenericEx& operator=(const CGenericEx&) = delete;

    const QString& message() const { return mMessage; }
    const QByteArray& className() const { return mClassName; }
    const QByteArray& sourceFile() const { return mSourceFile; }
    int line() const { return mLine; }

private:
    QByteArray mClassName;
    QString mMessage;
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

/// The process-wide record of every failure raised since it was last cleared, newest first. Raising and
/// catching never trim it. Safe to use from several threads.
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
