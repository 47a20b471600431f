#include "common/EnableExpression.h"

#include "common/FilterProperties.h"

#include <algorithm>
#include <array>
#include <iterator>

namespace orvela {

namespace {

// By the numbers of the modes.
constexpr std::string_view kModes[] = {
    "BitmapMode", "GrayScaleMode",    "IndexedMode",          "RGBMode",       "CMYKMode",   "HSLMode",
    "HSBMode",    "MultichannelMode", "DuotoneMode",          "LabMode",       "Gray16Mode", "RGB48Mode",
    "Lab48Mode",  "CMYK64Mode",       "DeepMultichannelMode", "Duotone16Mode", "RGB96Mode",  "Gray32Mode"};

[[noreturn]] void refuse(std::string_view expression) {
    throw ModuleError("its enable expression is not understood: " + std::string(expression));
}

std::string_view trimmed(std::string_view text) {
    const auto first = text.find_first_not_of(' ');
    const auto last = text.find_last_not_of(' ');
    return first == std::string_view::npos ? std::string_view() : text.substr(first, last - first + 1);
}

// Takes the text up to the next comma away, and the comma.
std::string_view nextName(std::string_view& rest) {
    const auto comma = rest.find(',');
    const std::string_view name = trimmed(rest.substr(0, comma));
    rest = comma == std::string_view::npos ? std::string_view() : rest.substr(comma + 1);
    return name;
}

} // namespace

bool isEnabledFor(std::string_view expression, host::ImageMode mode) {
    std::string_view rest = trimmed(expression);
    if (rest.empty())
        return true;
    const auto open = rest.find('(');
    if (open == std::string_view::npos || trimmed(rest.substr(0, open)) != "in" || rest.back() != ')')
        refuse(expression);
    rest = rest.substr(open + 1, rest.size() - open - 2);
    if (nextName(rest) != "PSHOP_ImageMode")
        refuse(expression);
    bool enabled = false;
    while (!rest.empty()) {
        const auto* found = std::find(std::begin(kModes), std::end(kModes), nextName(rest));
        if (found == std::end(kModes))
            refuse(expression);
        enabled = enabled || found - std::begin(kModes) == mode;
    }
    return enabled;
}

} // namespace orvela
