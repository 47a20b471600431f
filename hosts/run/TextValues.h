#pragma once

#include <string>
#include <utility>
#include <vector>

namespace orvela {

/// Reads the parts of option values. `what` names the option in the error.
namespace TextValues {

/// A number from `low` to `high`. @throws UsageError that names the range
double number(const std::string& what, const std::string& text, double low, double high);

/// The same without a fraction. @throws UsageError that names the range
int wholeNumber(const std::string& what, const std::string& text, int low, int high);

/// "on" or "off". @throws UsageError
bool onOrOff(const std::string& what, const std::string& text);

/// The two sides of NAME=VALUE. @throws UsageError when one is missing
std::pair<std::string, std::string> assignment(const std::string& what, const std::string& text);

std::vector<std::string> split(const std::string& text, char separator);
std::string joined(const std::vector<std::string>& parts, const std::string& separator);

/// The shortest decimal form, such as "0.5" or "255".
std::string shortest(double value);

} // namespace TextValues

} // namespace orvela
