#include "files/Refusal.h"

#include "files/Memory.h"
#include "files/Photograph.h"

#include <algorithm>
#include <cctype>

namespace orvela {

namespace fs = std::filesystem;

namespace {

// What the libraries for pictures say when an allocation failed.
bool tellsOfMemory(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text.find("memory") != std::string::npos || text.find("alloc") != std::string::npos ||
           text.find("no space for") != std::string::npos ||
           text.find("creating thread") != std::string::npos;
}

} // namespace

void refuse(const fs::path& path, const std::string& cause, const std::string& advice) {
    throw PhotographError(path.string() + ": " + cause + "; " + advice);
}

void refuseUnread(const fs::path& path, const std::string& text) {
    constexpr std::size_t kTelling = 120; // libraries repeat themselves for every row
    const std::string said = text.size() <= kTelling ? text : text.substr(0, kTelling) + "...";
    if (tellsOfMemory(text))
        throw MemoryError(path.string() + ": not enough memory (" + said + "); " + kMemoryAdvice);
    refuse(path, "is damaged or cut short (" + said + ")", kCopyAgain);
}

} // namespace orvela
