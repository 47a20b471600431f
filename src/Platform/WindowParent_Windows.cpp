#include "Platform/WindowParent.h"

#include <QWindow>

#include <windows.h>

namespace orvela {

void setHostParent(QWindow& window, void* hostWindow) {
    ::SetParent(reinterpret_cast<HWND>(window.winId()), static_cast<HWND>(hostWindow));
}

} // namespace orvela
