#include "run/TextValues.h"

#include "run/UsageError.h"

#include <charconv>
#include <sstream>

namespace orvela {

namespace TextValues {

namespace {

[[noreturn]] void failRange(const std::string& what, const std::string& text, const std::string& kind,
                            double low, double high) {
    throw UsageError(what + " \"" + text + "\": " + kind + " from " + shortest(low) + " to " +
                     shortest(high) + " is needed");
}

} // namespace

double number(const std::string& what, const std::string& text, double low, double high) {
    double value = 0;
    const char* end = text.data() + text.size();
    const auto [stopped, error] = std::from_chars(text.data(), end, value);
    // A text that is not a number compares false as well.
    if (error != std::errc() || stopped != end || !(value >= low && value <= high))
        failRange(what, text, "a number", low, high);
    return value;
}

int wholeNumber(const std::string& what, const std::string& text, int low, int high) {
    int value = 0;
    const char* end = text.data() + text.size();
    const auto [stopped, error] = std::from_chars(text.data(), end, value);
    if (error != std::errc() || stopped != end || value < low || value > high)
        failRange(what, text, "a whole number", low, high);
    return value;
}

bool onOrOff(const std::string& what, const std::string& text) {
    if (text != "on" && text != "off")
        throw UsageError(what + " \"" + text + "\": on or off is needed");
    return text == "on";
}

std::pair<std::string, std::string> assignment(const std::string& what, const std::string& text) {
    const std::size_t equals = text.find('=');
    if (equals == std::string::npos || equals == 0 || equals + 1 == text.size())
        throw UsageError(what + " \"" + text + "\": NAME=VALUE is needed");
    return {text.substr(0, equals), text.substr(equals + 1)};
}

std::vector<std::string> split(const std::string& text, char separator) {
    std::vector<std::string> parts;
    std::istringstream stream(text + separator);
    for (std::string part; std::getline(stream, part, separator);)
        parts.push_back(part);
    return parts;
}

std::string joined(const std::vector<std::string>& parts, const std::string& separator) {
    std::string text;
    for (const std::string& part : parts)
        text += (text.empty() ? "" : separator) + part;
    return text;
}

std::string shortest(double value) {
    char text[32];
    const auto [end, error] = std::to_chars(std::begin(text), std::end(text), value);
    return {text, end};
}

} // namespace TextValues

} // namespace orvela
