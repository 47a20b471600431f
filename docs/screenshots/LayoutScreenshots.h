#pragma once

#include <QString>

/// Drives the windows over a photograph, as a user does, and takes each layout from the screen, with the
/// frames that the window manager draws: "FOLDER/LAYOUT-SUFFIX.png".
/// @return false when the photograph cannot be read or a picture cannot be written
bool takeLayouts(const QString& photo, const QString& folder, const QString& suffix);
