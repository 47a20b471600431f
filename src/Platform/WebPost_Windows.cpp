#include "Platform/WebPost.h"

#include <windows.h>
#include <wininet.h>

#include <algorithm>
#include <exception>
#include <functional>
#include <future>
#include <memory>
#include <type_traits>

namespace orvela {

namespace WebPost {

namespace {

struct Closer {
    void operator()(HINTERNET handle) const { InternetCloseHandle(handle); }
};
using Handle = std::unique_ptr<std::remove_pointer_t<HINTERNET>, Closer>;

constexpr DWORD kRequestFlags = 1;
constexpr DWORD kUntilZero = static_cast<DWORD>(-1); // the header ends at its terminating zero
constexpr char kHeader[] = "Content-Type: application/x-www-form-urlencoded\r\n";

Reply failure(const char* text) {
    return {{}, text};
}

std::string readAll(HINTERNET request) {
    std::string body;
    char piece[1024];
    DWORD count = 0;
    while (body.size() < kMostBytes && InternetReadFile(request, piece, sizeof piece, &count) && count > 0)
        body.append(piece, count);
    body.resize(std::min(body.size(), kMostBytes));
    return body;
}

// To be set for the request itself: what is set for the handle that it descends from does not count
// everywhere.
void limitEachCall(HINTERNET request, std::chrono::milliseconds limit) {
    auto milliseconds = static_cast<DWORD>(limit.count());
    for (const DWORD option :
         {INTERNET_OPTION_CONNECT_TIMEOUT, INTERNET_OPTION_SEND_TIMEOUT, INTERNET_OPTION_RECEIVE_TIMEOUT})
        InternetSetOptionA(request, option, &milliseconds, sizeof milliseconds);
    DWORD once = 1;
    InternetSetOptionA(request, INTERNET_OPTION_CONNECT_RETRIES, &once, sizeof once);
}

Reply transfer(HINTERNET internet, const Form& form) {
    const Handle connection(
        InternetConnectA(internet, form.host.c_str(), form.port, "", "", INTERNET_SERVICE_HTTP, 0, 0));
    if (!connection)
        return failure("Unable to etablish contact with server.");
    const Handle request(HttpOpenRequestA(connection.get(), "POST", form.path.c_str(), nullptr, nullptr,
                                          nullptr, kRequestFlags, 0));
    if (!request)
        return failure("Unable to etablish contact with server.");
    limitEachCall(request.get(), form.limit);
    std::string body = form.body; // the call takes no constant
    if (!HttpSendRequestA(request.get(), kHeader, kUntilZero, body.data(), static_cast<DWORD>(body.size())))
        return failure("Unable to send data to server.");
    return {readAll(request.get()), {}};
}

} // namespace

// The calls have no limit for a transfer as a whole: another thread makes them, and closing the handle that
// theirs descend from cancels them, as the system's documentation has it. One that does not notice, which has
// been seen under wine, is ended by its own limit; only the lookup of a name has none. The thread is waited
// for in any case, since the module may be unloaded once this returns. Not yet seen on Windows.
Reply post(const Form& form) {
    Handle internet(InternetOpenA(form.agent.c_str(), INTERNET_OPEN_TYPE_PRECONFIG, nullptr, nullptr, 0));
    if (!internet)
        return failure("No internet connection has been detected.");
    try {
        auto reply = std::async(std::launch::async, transfer, internet.get(), std::cref(form));
        const bool isLate = reply.wait_for(form.limit) == std::future_status::timeout;
        if (isLate)
            internet.reset();
        Reply received = reply.get();
        return isLate ? failure("Unable to send data to server.") : received;
    } catch (const std::exception&) { // no thread or no memory to be had
        return failure("No internet connection has been detected.");
    }
}

} // namespace WebPost

} // namespace orvela
