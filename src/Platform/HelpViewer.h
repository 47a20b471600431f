#pragma once

#include <QString>
#include <QWindow>

namespace orvela {

/// The system's own viewer of compiled help files.
namespace HelpViewer {

/// Where the compiled manual lies: below the folder of the program that the filter runs in.
QString compiledManual();

/// Shows a topic, FILE::/PAGE, in a viewer that belongs to the window `owner`. False where the system has
/// none or it cannot be loaded.
bool show(WId owner, const QString& topic);

} // namespace HelpViewer

} // namespace orvela
