#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <string>

namespace orvela {

/// Sends forms to a web server. Each system has its own source.
namespace WebPost {

/// A form and where it goes.
struct Form {
    std::string host;
    std::uint16_t port = 80;
    std::string path;                      ///< on the server, without a slash at the front
    std::string body;                      ///< its fields, encoded
    std::string agent;                     ///< what the sender calls itself
    std::chrono::milliseconds limit{3000}; ///< of the whole transfer, from the server's name to the last byte
};

/// What the server sent back.
struct Reply {
    std::string body;  ///< whatever its status was; cut at kMostBytes, and where the connection was
    std::string error; ///< why nothing came back; empty when something did
};

/// Nothing is read beyond so many bytes of a reply.
constexpr std::size_t kMostBytes = 4096;

/// Posts the form and waits for the reply, without serving the user in the meantime. It goes through the
/// proxy that is set up for the system, on Linux by the variable http_proxy. Only Windows follows
/// redirections, as its library does by itself. A transfer that takes too long is given up.
Reply post(const Form& form);

} // namespace WebPost

} // namespace orvela
