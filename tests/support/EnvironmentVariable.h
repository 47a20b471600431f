#pragma once

#include <QByteArray>

namespace orvela {

/// Sets an environment variable for as long as it lives.
class EnvironmentVariable {
public:
    EnvironmentVariable(const char* name, const QByteArray& value) : mName(name), mBefore(qgetenv(name)) {
        qputenv(name, value);
    }
    ~EnvironmentVariable() { mBefore.isNull() ? qunsetenv(mName) : qputenv(mName, mBefore); }
    EnvironmentVariable(const EnvironmentVariable&) = delete;
    EnvironmentVariable& operator=(const EnvironmentVariable&) = delete;

private:
    const char* mName;
    QByteArray mBefore;
};

} // namespace orvela
