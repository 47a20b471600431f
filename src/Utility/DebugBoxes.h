#pragma once

#include <QString>

namespace orvela {

/// Message boxes of the engine. The engine has no windows: the user interface installs a presenter that shows
/// a modal box; without one every box counts as answered with OK.
namespace DebugBoxes {

/// Button codes, equal to the user interface toolkit's own.
enum Button : int { Ok = 0x00000400 };

/// Shows a modal warning box over `parent` (an opaque widget pointer, may be null) and returns the button
/// pressed.
using Presenter = int (*)(void* parent, const QString& title, const QString& text, int buttons,
                          int defaultButton);

/// Installs what shows the boxes; null takes it away.
void setPresenter(Presenter presenter);

/// The parent of debug warnings: the main window, null while there is none.
void setMainWindow(void* widget);
void* mainWindow();

/// Shows the box only when the environment variable "ORVELA_DEBUG_MBOX" is set; else returns OK at once.
int debugBox(void* parent, const QString& title, const QString& text, int buttons = Ok,
             int defaultButton = Ok);

/// Always shows the box.
int warningBox(void* parent, const QString& title, const QString& text, int buttons = Ok,
               int defaultButton = Ok);

/// A debug box over the main window with an OK button only.
void debugWarning(const QString& text, const QString& title);

} // namespace DebugBoxes

} // namespace orvela
