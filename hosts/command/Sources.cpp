#include "command/Sources.h"

#include "command/Messages.h"
#include "command/Targets.h"
#include "files/FileFormat.h"

#include <glob.h>

#include <algorithm>
#include <set>

namespace orvela {

namespace fs = std::filesystem;

namespace {

bool isHidden(const fs::path& file) {
    return file.filename().string().starts_with('.');
}

// @throws fs::filesystem_error when not all of the folder can be read
std::vector<fs::path> photographsIn(const fs::path& folder) {
    std::vector<fs::path> found;
    std::error_code none; // a file that cannot be looked at fails when it is read
    for (const fs::directory_entry& entry : fs::directory_iterator(folder))
        if (formatOfExtension(entry.path()) && !isHidden(entry.path()) && !isEarlierResult(entry.path()) &&
            !entry.is_directory(none))
            found.push_back(entry.path());
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
        std::vector<fs::path> found;
        try {
            found = expand(argument);
            if (found.empty())
                sources.unmatched.push_back(argument);
        } catch (const fs::filesystem_error& error) {
            sources.failures.push_back(argument + ": the folder cannot be read (" + error.code().message() +
                                       "); ask its owner for access");
        }
        for (const fs::path& photograph : found)
            if (known.insert(realPath(photograph)).second)
                sources.photographs.push_back(photograph);
    }
    return sources;
}

ExitStatus report(const Sources& sources) {
    for (const std::string& failure : sources.failures)
        Messages::tell(failure);
    for (const std::string& argument : sources.unmatched)
        Messages::tell(argument + ": no photograph matches");
    if (!sources.failures.empty())
        return ExitStatus::PhotographFailed;
    return sources.unmatched.empty() ? ExitStatus::Done : ExitStatus::NothingMatched;
}

} // namespace orvela
