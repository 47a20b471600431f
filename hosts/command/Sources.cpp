#include "command/Sources.h"

#include "command/Targets.h"
#include "common/FileFormat.h"

#include <glob.h>

#include <algorithm>
#include <set>

namespace orvela {

namespace fs = std::filesystem;

namespace {

std::vector<fs::path> photographsIn(const fs::path& folder) {
    std::vector<fs::path> found;
    std::error_code error;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end; entry.increment(error))
        if (formatOfExtension(entry->path()) && !isEarlierResult(entry->path()) &&
            !entry->is_directory(error))
            found.push_back(entry->path());
    std::sort(found.begin(), found.end());
    return found;
}

std::vector<fs::path> matching(const std::string& pattern) {
    std::vector<fs::path> found;
    glob_t matches = {};
    if (glob(pattern.c_str(), 0, nullptr, &matches) == 0)
        found.assign(matches.gl_pathv, matches.gl_pathv + matches.gl_pathc);
    globfree(&matches);
    return found;
}

std::vector<fs::path> expand(const std::string& argument) {
    std::error_code error;
    if (fs::is_directory(argument, error))
        return photographsIn(argument);
    const bool isPattern = argument.find_first_of("*?[") != std::string::npos;
    return isPattern && !fs::exists(argument, error) ? matching(argument) : std::vector<fs::path>{argument};
}

} // namespace

Sources findSources(const std::vector<std::string>& arguments) {
    Sources sources;
    std::set<fs::path> known;
    for (const std::string& argument : arguments) {
        const std::vector<fs::path> found = expand(argument);
        if (found.empty())
            sources.unmatched.push_back(argument);
        for (const fs::path& photograph : found)
            if (known.insert(realPath(photograph)).second)
                sources.photographs.push_back(photograph);
    }
    return sources;
}

} // namespace orvela
