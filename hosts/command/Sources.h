#pragma once

#include "command/ExitStatus.h"

#include <filesystem>
#include <string>
#include <vector>

namespace orvela {

/// The photographs that the arguments of a command stand for.
struct Sources {
    std::vector<std::filesystem::path> photographs; ///< each file once, in the order of the arguments
    std::vector<std::string> unmatched;             ///< folders and patterns without a photograph
    std::vector<std::string> failures;              ///< of folders that could not be read, with what to do
};

/// An argument is a file (existing or not), a folder (the photographs in it, by name; hidden
/// files and results of earlier runs left out) or a shell pattern that no file matches literally.
Sources findSources(const std::vector<std::string>& arguments);

/// Tells what could not be read and which arguments matched nothing.
ExitStatus report(const Sources& sources);

} // namespace orvela
