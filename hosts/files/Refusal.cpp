#include "files/Refusal.h"

#include "files/Photograph.h"

#include <algorithm>
#include <limits>

namespace orvela {

namespace fs = std::filesystem;

void refuse(const fs::path& path, const std::string& cause, const std::string& advice) {
    throw PhotographError(path.string() + ": " + cause + "; " + advice);
}

void checkEdges(std::int64_t width, std::int64_t height, const fs::path& path) {
    if (width < 1 || height < 1)
        refuse(path, "has no pixels", kCopyAgain);
    if (std::max(width, height) > std::numeric_limits<std::int16_t>::max())
        refuse(path, "is over 32767 pixels wide or high", "scale it down or cut it into parts");
}

} // namespace orvela
