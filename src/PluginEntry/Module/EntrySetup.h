#pragma once

#include <QString>

namespace orvela {

/// What every call of the module sets up in the process before it acts: the log, the application's names, the
/// toolkit's messages, the language. What the host may have set up for itself comes back when this object
/// dies.
class EntrySetup {
public:
    /// @throws CGenericEx when the module's own file name cannot be obtained
    EntrySetup();
    ~EntrySetup();
    EntrySetup(const EntrySetup&) = delete;
    EntrySetup& operator=(const EntrySetup&) = delete;

private:
    QString mOrganization;
    QString mDomain;
    QString mApplication;
    QtMessageHandler mHandler;
};

} // namespace orvela
