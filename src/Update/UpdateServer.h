#pragma once

#include <QString>

namespace orvela {

/// The maker's web server, which knows the latest version.
struct UpdateServer {
    QString host; ///< empty when the name given for it is none
    quint16 port = 80;

    /// Whether there is such a server. There is none of a name that is reserved for examples, as the one that
    /// a build has by default.
    bool exists() const;
};

/// The server that was chosen when the build was configured (ORVELA_UPDATE_SERVER), or that the environment
/// variable of that name gives: "host" or "host:port".
UpdateServer updateServer();

} // namespace orvela
