#pragma once

namespace orvela {

/// Opens a photograph in the windows of the filter, as a host does, and writes what comes of it:
///
///     orvela_edit PHOTO -o RESULT [--mode NAME] [--force]
///
/// With a mode its processing window opens, else the main window. Needs a display.
/// @return 0 when the windows were closed, whether with OK or not, 1 when something failed, 2 on wrong usage
int runEdit(int argc, char** argv);

} // namespace orvela
