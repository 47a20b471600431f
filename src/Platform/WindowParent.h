#pragma once

class QWindow;

namespace orvela {

/// Makes a host's native window the parent of `window`, so that it stays above it. Each system has its own
/// source.
/// @param hostWindow  the window's native handle, null for none
void setHostParent(QWindow& window, void* hostWindow);

} // namespace orvela
