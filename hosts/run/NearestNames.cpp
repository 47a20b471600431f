#include "run/NearestNames.h"

#include "run/TextValues.h"

#include <algorithm>
#include <cctype>
#include <numeric>

namespace orvela {

namespace NearestNames {

namespace {

// What it counts that only a part of a name was meant.
constexpr std::size_t kPart = 2;

// Fewest insertions, deletions and replacements that turn one text into the other; into its beginning counts
// two more.
std::size_t editDistance(std::string_view from, std::string_view to) {
    std::vector<std::size_t> row(to.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 1; i <= from.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i;
        for (std::size_t j = 1; j <= to.size(); ++j) {
            const std::size_t replaced = diagonal + (from[i - 1] == to[j - 1] ? 0 : 1);
            diagonal = row[j];
            row[j] = std::min({row[j] + 1, row[j - 1] + 1, replaced});
        }
    }
    return std::min(row.back(), *std::min_element(row.begin(), row.end()) + kPart);
}

std::size_t distance(const std::string& wanted, const std::string& name) {
    const std::size_t changes = editDistance(wanted, name);
    return name.find(wanted) != std::string::npos ? std::min(kPart, changes) : changes;
}

} // namespace

std::string plain(std::string_view name) {
    std::string text;
    for (const unsigned char c : name)
        if (std::isalnum(c))
            text += static_cast<char>(std::tolower(c));
    return text;
}

std::vector<std::string> of(std::string_view wanted, const std::vector<std::string>& names) {
    const std::string text = plain(wanted);
    // With more changes than that anything becomes anything.
    const std::size_t most = text.size() < 3 ? 1 : std::max(kPart, text.size() * 2 / 5);
    std::vector<std::pair<std::size_t, std::string>> ranked;
    for (const std::string& name : names)
        if (const std::size_t changes = distance(text, plain(name)); changes <= most)
            ranked.emplace_back(changes, name);
    std::stable_sort(ranked.begin(), ranked.end(),
                     [](const auto& a, const auto& b) { return a.first < b.first; });
    std::vector<std::string> nearest;
    for (const auto& [changes, name] : ranked)
        if (nearest.size() < 3 && changes == ranked.front().first)
            nearest.push_back(name);
    return nearest;
}

std::string advice(std::string_view wanted, const std::vector<std::string>& names, const std::string& list) {
    const std::vector<std::string> nearest = of(wanted, names);
    return "; " + (nearest.empty() ? "" : "did you mean " + TextValues::joined(nearest, " or ") + "? ") +
           list;
}

} // namespace NearestNames

} // namespace orvela
