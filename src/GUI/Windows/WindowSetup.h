#pragma once

#include <QFont>
#include <QList>

#include <initializer_list>

class QPoint;
class QToolButton;
class QWidget;

namespace orvela {

class SettingsEdit;

/// Takes the relief from buttons: the shading roles of their palette become the brush of the window.
void flatten(std::initializer_list<QWidget*> buttons);

/// Names buttons without a text, and lists, by their tool tips, for who does not see their pictures. Those
/// that have a name keep it.
void nameByToolTips(const QWidget& window);

/// Moves a window that is shown into its screen, by its upper left corner where it is larger than that.
void keepOnScreen(QWidget& window);

/// Moves a window that has not been shown to where the settings store says that one of its class was last. It
/// stays where it is when there is none, or when no screen shows its title there.
void restorePosition(QWidget& window);

/// Whether enough of the title of a window so wide would show at `position` to take hold of it.
bool isReachable(const QPoint& position, int width);

/// Writes where the window is. A store that cannot be written does not stop it.
void storePosition(const QWidget& window);

/// Puts where the window is into `edit`.
void addPosition(SettingsEdit& edit, const QWidget& window);

/// Gives buttons, shown with their texts, the largest font not above `font` in which every text has room in
/// `width` pixels. It does not go below seven tenths of it.
void fitTexts(const QList<QToolButton*>& buttons, QFont font, int width);

/// The pixels that a button needs for its icon and its text.
int toolButtonWidth(const QToolButton& button);

} // namespace orvela
