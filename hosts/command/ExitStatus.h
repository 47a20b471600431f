#pragma once

#include <stdexcept>

namespace orvela {

/// What the program tells its caller.
enum class ExitStatus : int {
    Done = 0,
    PhotographFailed = 1,
    WrongUsage = 2,
    NothingMatched = 3,
    TargetTrouble = 4, ///< a target that cannot be written or must not be overwritten; no memory
};

/// The exit status of a program that signal n ended is this plus n.
inline constexpr int kSignalBase = 128;

/// Arguments that make no sense: refused before any work starts.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

} // namespace orvela
