#pragma once

#include <initializer_list>

class QWidget;

namespace orvela {

/// Takes the relief from buttons: the shading roles of their palette become the brush of the window.
void flatten(std::initializer_list<QWidget*> buttons);

/// Moves a window that has not been shown to where the settings store says that one of its class was last. It
/// stays where it is when there is none, or when no screen shows its title there.
void restorePosition(QWidget& window);

/// Writes where the window is. A store that cannot be written is logged and does not stop it.
void storePosition(const QWidget& window);

} // namespace orvela
