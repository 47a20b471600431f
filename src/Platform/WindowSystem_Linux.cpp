#include "Platform/WindowSystem.h"

#include <QFile>
#include <QLibraryInfo>

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>
#include <xcb/xcb.h>

#include <cstdlib>
#include <cstring>
#include <sstream>
#include <string>

namespace orvela {

namespace {

std::string variable(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

std::shared_ptr<void> reachX11() {
    std::shared_ptr<xcb_connection_t> connection(::xcb_connect(nullptr, nullptr), ::xcb_disconnect);
    return ::xcb_connection_has_error(connection.get()) == 0 ? connection : nullptr;
}

bool hasPlugin(const std::string& name) {
    return QFile::exists(
        QStringLiteral("%1/platforms/libq%2.so")
            .arg(QLibraryInfo::path(QLibraryInfo::PluginsPath), QString::fromStdString(name)));
}

std::string waylandSocket() {
    const std::string display = variable("WAYLAND_DISPLAY");
    const std::string name = display.empty() ? "wayland-0" : display;
    return name.front() == '/' ? name : variable("XDG_RUNTIME_DIR") + '/' + name;
}

bool reachesWayland(const std::string& name) {
    sockaddr_un address{};
    const std::string path = waylandSocket();
    if (path.size() >= sizeof address.sun_path)
        return false;
    address.sun_family = AF_UNIX;
    std::memcpy(address.sun_path, path.c_str(), path.size());
    const int handle = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    const bool reached =
        handle >= 0 && ::connect(handle, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
    ::close(handle);
    const std::string plugin = name == "wayland" ? "wayland-generic" : name;
    return reached && hasPlugin(plugin);
}

// Others, such as those that draw on the bare screen, end the process where they cannot.
bool needsNobody(const std::string& name) {
    return name == "offscreen" || name == "minimal" || name == "vnc";
}

} // namespace

// Those that the user wants, with what is asked of them; else X11 first: under Wayland windows can neither
// stand above those of another program nor where they stood.
WindowSystem reachWindowSystem() {
    const std::string wanted = variable("QT_QPA_PLATFORM");
    std::istringstream entries(wanted.empty() ? "xcb;wayland" : wanted);
    for (std::string entry; std::getline(entries, entry, ';');) {
        const std::string name = entry.substr(0, entry.find(':'));
        if (name == "xcb" && hasPlugin(name)) {
            if (std::shared_ptr<void> connection = reachX11())
                return {entry, connection};
        } else if (needsNobody(name) || (name.rfind("wayland", 0) == 0 && reachesWayland(name))) {
            return {entry, nullptr};
        }
    }
    return {};
}

} // namespace orvela
