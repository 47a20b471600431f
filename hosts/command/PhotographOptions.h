#pragma once

#include "command/Targets.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"

#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace orvela {

/// The arguments that every command on photographs takes.
struct PhotographOptions {
    std::vector<std::string> photographs; ///< files, folders and patterns
    TargetOptions targets;
    bool quiet = false;
    ReadOptions reading;
    WriteOptions writing;

    /// Declares the arguments to the parser, which fills this object when it parses.
    void declare(CLI::App& app);
};

} // namespace orvela
