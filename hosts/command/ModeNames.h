#pragma once

#include "Settings/ModeTable.h"

#include <string>
#include <string_view>
#include <vector>

namespace orvela {

/// The modes as the command line names them.
namespace ModeNames {

/// Every mode that can be chosen by name, in the order of their numbers.
std::vector<const ModeDescription*> selectable();

/// One word that names the mode and no other: the preset identifier, or the display name without blanks.
std::string identifierOf(const ModeDescription& mode);

/// The selectable mode with that display name or identifier. Case, blanks and punctuation do not matter; of
/// two modes with one display name the first is meant. Null when there is none.
const ModeDescription* find(std::string_view name);

/// Up to three identifiers, the nearest to `name` first.
std::vector<std::string> nearest(std::string_view name);

/// `name` in lower case without anything but letters and digits.
std::string plain(std::string_view name);

} // namespace ModeNames

} // namespace orvela
