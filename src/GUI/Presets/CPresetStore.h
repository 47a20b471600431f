#pragma once

#include "Settings/FactoryPresets.h"
#include "Settings/PresetTree.h"

class QWidget;

/// Keeps the state of a pane's slider blocks, colour pickers and check boxes by name in the settings store.
/// Nothing is cached: each operation opens the store, reads or writes, and closes it.
namespace CPresetStore {

using orvela::FactoryPresets::factoryPresetMode;
using orvela::FactoryPresets::factoryPresetName;
using orvela::FactoryPresets::isFactoryMode;
using orvela::FactoryPresets::isFactoryPresetName;

/// The reserved name under which the last accepted run's settings are kept.
QString batchPresetName();

/// The names of the mode's presets in the store's order, without the reserved one if wished.
QStringList listPresets(EGUIMode mode, bool excludeBatch);

/// Whether the mode has a preset of that name; never for the reserved one.
bool presetExists(EGUIMode mode, const QString& name);

/// Whether there is a preset of any mode, reserved ones included.
bool hasPresets();

/// Removes a preset, whichever it is. When the store cannot be written a warning says so and it stays.
/// @return whether it is gone
bool removePreset(EGUIMode mode, const QString& name);

/// What a preset of the controls below `parent` that have a name would hold.
orvela::PresetContent contentOf(const QWidget* parent);

/// Puts `content` onto the controls below `parent`. Controls without an entry keep their state, entries
/// without a control are skipped.
void show(const QWidget* parent, const orvela::PresetContent& content);

/// Puts a preset onto the controls below `parent`. Controls without an entry keep their state, entries
/// without a control are skipped; without such a preset nothing happens.
void loadPreset(QWidget* parent, EGUIMode mode, const QString& name);

/// Writes the controls below `parent` that have a name as a preset; entries of other controls stay in it. An
/// empty name is refused with a message. When the store cannot be written a warning names it, and the old
/// preset stays; of the reserved preset, which nobody asked to be saved, once.
/// @param saved         becomes true when the preset was written
/// @param isNew         becomes true when there was no such preset or the question was not asked
/// @param askOverwrite  asks before an existing preset is written over
void savePreset(QWidget* parent, EGUIMode mode, const QString& name, bool& saved, bool& isNew,
                bool askOverwrite);

/// Writes all twelve factory presets when one of them is missing. No control is needed or touched. When the
/// store cannot be written a warning names it, once.
void ensureFactoryPresets(QWidget* parent);

} // namespace CPresetStore
