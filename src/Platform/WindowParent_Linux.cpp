#include "Platform/WindowParent.h"

#include <QGuiApplication>
#include <QWindow>

namespace orvela {

// Only X11 knows the windows of other programs by a number; there the window stays above without being taken
// in.
void setHostParent(QWindow& window, void* hostWindow) {
    if (!hostWindow || QGuiApplication::platformName() != QLatin1String("xcb"))
        return;
    if (QWindow* host = QWindow::fromWinId(reinterpret_cast<WId>(hostWindow))) {
        window.setTransientParent(host);
        QObject::connect(&window, &QObject::destroyed, host, &QObject::deleteLater);
    }
}

} // namespace orvela
