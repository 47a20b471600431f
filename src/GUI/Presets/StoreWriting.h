#pragma once

#include "Settings/SettingsEdit.h"

namespace orvela {

/// Changes of the settings store that windows make: one that fails gives a warning that names the file, and
/// no window and no picture is lost by it.
namespace StoreWriting {

/// Who wants a change. A change that nobody asked for (a window's place, the last run's settings) is warned
/// of once, and again only after a change was made in between.
enum class Cause { User, Program };

/// Makes the change. False when it could not be made; the store then holds the old values.
bool commit(const SettingsEdit& edit, Cause cause);

} // namespace StoreWriting

} // namespace orvela
