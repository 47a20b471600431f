#pragma once

namespace orvela {

/// What the program tells its caller. A batch tells the highest status of its photographs: trouble that the
/// next run will meet again says more than a photograph that failed by itself. An argument that matched
/// nothing says less than any of them and counts only when all photographs were done.
enum class ExitStatus : int {
    Done = 0,
    PhotographFailed = 1, ///< also whatever else went wrong
    WrongUsage = 2,
    NothingMatched = 3,
    TargetTrouble = 4, ///< a target that cannot be written or must not be overwritten
    OutOfMemory = 5,
    Cancelled = 6, ///< the user cancelled in the windows; the other photographs were done
};

/// The exit status of a program that signal n ended is this plus n.
inline constexpr int kSignalBase = 128;

} // namespace orvela
