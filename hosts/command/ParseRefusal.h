#pragma once

#include <string>

namespace CLI {
class App;
class ParseError;
} // namespace CLI

namespace orvela {

/// Why arguments were refused, on one line, with the nearest name where one was misspelt and where to look.
std::string parseRefusal(const CLI::App& program, const CLI::ParseError& error);

} // namespace orvela
