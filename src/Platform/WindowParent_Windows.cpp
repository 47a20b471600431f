#include "Platform/WindowParent.h"

#include <QWidget>

#include <windows.h>

namespace orvela {

void setHostParent(QWidget& window, void* hostWindow) {
    ::SetParent(reinterpret_cast<HWND>(window.winId()), static_cast<HWND>(hostWindow));
}

} // namespace orvela
