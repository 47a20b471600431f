#pragma once

#include <QSettings>

namespace orvela {

/// Opens the user's settings store, that of the organisation "Kestrand" and the application "Orvela". It is
/// named here and not taken from the application object: inside another program that bears that program's
/// names.
QSettings openSettings();

/// The file of the store on systems without a registry, told without reading it.
QString settingsPath();

/// Has the store of another application opened from now on. Tests keep to one of their own.
void setSettingsApplication(const QString& name);

} // namespace orvela
