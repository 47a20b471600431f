#pragma once

class QWidget;

namespace orvela {

/// Lets the engine's warnings and debug warnings appear as modal message boxes, those without a parent above
/// the window that the user works with. Called once by whoever starts the windows. Where there are none, as
/// on a worker thread or without a QApplication, a box still counts as answered with OK.
void installMessageBoxes();

/// Makes `window` the main window, above which message boxes appear, for as long as it lives.
void setMainWindow(QWidget& window);

} // namespace orvela
