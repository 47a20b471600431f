#pragma once

#include <string>
#include <string_view>

namespace orvela {

/// What the program says, a line each.
namespace Messages {

/// `text` as a terminal can show it on one line: control characters, marks that turn the direction of writing
/// and bytes that are no UTF-8 are escaped, such as \n and \x1b.
std::string shown(std::string_view text);

/// Writes "orvela: " and the text to standard error, escaped, and without its middle where it is long.
void tell(std::string_view text);

} // namespace Messages

} // namespace orvela
