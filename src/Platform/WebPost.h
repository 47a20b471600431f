#pragma once

#include <QByteArray>
#include <QString>

#include <chrono>

namespace orvela {

/// Sends forms to a web server. Each system has its own source.
namespace WebPost {

/// A form and where it goes.
struct Form {
    QString host;
    quint16 port = 80;
    QByteArray path;                       ///< on the server, without a slash at the front
    QByteArray body;                       ///< its fields, encoded
    QByteArray agent;                      ///< what the sender calls itself
    std::chrono::milliseconds limit{3000}; ///< of the whole transfer, from the server's name to the last byte
};

/// What the server sent back.
struct Reply {
    QByteArray body; ///< whatever its status was; cut at kMostBytes, and where the connection was
    QString error;   ///< why nothing came back; empty when something did
};

/// Nothing is read beyond so many bytes of a reply.
constexpr int kMostBytes = 4096;

/// Posts the form and waits for the reply, without serving the user in the meantime. It goes through the
/// proxy that is set up for the system, on Linux by the variable http_proxy. Only Windows follows
/// redirections, as its library does by itself. A transfer that takes too long is given up.
Reply post(const Form& form);

} // namespace WebPost

} // namespace orvela
