#pragma once

#include "Settings/CSliderParams.h"
#include "Settings/EGUIMode.h"

#include <QStringList>

class QUrl;
class QWidget;

namespace orvela {

/// Preset files that are dropped on a window.
namespace PresetDrop {

/// The file that was dropped.
/// @throws PresetError when it is none, or several
QString fileOf(const QList<QUrl>& dropped);

/// Puts the settings of a preset file onto the controls below `parent`: what it switches on is on, everything
/// else off; sliders that it does not name keep their positions.
/// @param now  the settings as the controls have them
/// @return the labels of what the file switches on and the mode has no control for
/// @throws PresetError when the file is no preset, or holds nothing that the mode has a control for; the
///         controls stay as they were
QStringList load(QWidget* parent, EGUIMode mode, CSliderParams now, const QString& path);

} // namespace PresetDrop

} // namespace orvela
