#pragma once

#include "Settings/EGUIMode.h"
#include "Settings/SettingsEdit.h"

#include <QList>
#include <QStringList>

namespace orvela {

/// What a stored preset says of a slider block.
struct PresetSlider {
    QString object;
    double value = 0; ///< position, 0 to 1000
    bool enabled = false;

    bool operator==(const PresetSlider&) const = default;
};

/// What a stored preset says of a colour picker: 0 to 255 each.
struct PresetColor {
    QString object;
    int red = 0;
    int green = 0;
    int blue = 0;

    bool operator==(const PresetColor&) const = default;
};

/// What a stored preset says of a check box.
struct PresetCheckBox {
    QString object;
    bool checked = false;

    bool operator==(const PresetCheckBox&) const = default;
};

/// A stored preset: states by object name of the control.
struct PresetContent {
    QList<PresetSlider> sliders;
    QList<PresetColor> colors;
    QList<PresetCheckBox> checkBoxes;

    bool operator==(const PresetContent&) const = default;
};

/// The keys of the user interface in the settings store, and the presets there:
///
///     2000/UserPresets/MODE/PRESET/Sliders/OBJECT/Value, Enabled
///                                  ColorPickers/OBJECT/Red, Green, Blue
///                                  CheckBoxes/OBJECT/Checked
///
/// A slash or backslash in a name would part keys; it is stored as %2F or %5C, and a name that has such a
/// sequence of its own gets it as %252F or %255C.
namespace PresetTree {

/// The key of a value of the user interface, such as that of "batchMode" or of "CDlgMainImpl/pos".
QString guiKey(const QString& name);

/// A stored switch: "true" in any case, "1" and a true switch are on, everything else is off.
bool switchOf(const QVariant& value);

/// The reserved name of the last accepted run's settings.
QString batchPresetName();

/// The key of the number of the mode whose accepted settings are replayed.
QString batchModeKey();

/// The names of the mode's presets in the store's order, the reserved one included; none for a value that is
/// not a mode.
QStringList names(EGUIMode mode);

/// The same without the reserved one: what the user is offered.
QStringList offeredNames(EGUIMode mode);

/// True when the mode has a preset of that name, also the reserved one. Asks for it alone.
bool exists(EGUIMode mode, const QString& name);

/// True when there is a preset of any mode, also a reserved one.
bool hasPresets();

/// A stored preset, its entries in the store's order; none when there is no preset of that name. Values that
/// are missing or of another type are 0 or false, numbers out of range are clamped.
std::optional<PresetContent> read(EGUIMode mode, const QString& name);

/// Puts writing a preset into `edit`. Entries of an older preset of that name which `content` does not have
/// stay.
/// @throws CGenericEx for an empty name or a value that is not a mode
void write(SettingsEdit& edit, EGUIMode mode, const QString& name, const PresetContent& content);

/// Puts removing a preset with everything below it into `edit`. @throws as write()
void remove(SettingsEdit& edit, EGUIMode mode, const QString& name);

} // namespace PresetTree

} // namespace orvela
