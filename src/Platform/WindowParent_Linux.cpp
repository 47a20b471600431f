#include "Platform/WindowParent.h"

#include <QGuiApplication>
#include <QWidget>
#include <QWindow>

namespace orvela {

// Only X11 knows the windows of other programs by a number; there they stay above without being taken in.
void setHostParent(QWidget& window, void* hostWindow) {
    if (!hostWindow || QGuiApplication::platformName() != QLatin1String("xcb"))
        return;
    QWindow* host = QWindow::fromWinId(reinterpret_cast<WId>(hostWindow));
    if (!host)
        return;
    host->setParent(nullptr);
    window.winId(); // has to have a native window
    window.windowHandle()->setTransientParent(host);
    QObject::connect(&window, &QObject::destroyed, host, &QObject::deleteLater);
}

} // namespace orvela
