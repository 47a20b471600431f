#pragma once

namespace orvela {

/// Which pixels a filter writes in its pass.
enum class Writes {
    EveryPixel, ///< of every row of its pass; the frame fills in the other rows from the input
    SomePixels, ///< the frame fills in the others
    Nothing,    ///< it only measures
};

/// What a task says of itself, once; the frame acts on it. Texts are lines of the log at the debug level,
/// null for none.
struct TaskDescription {
    const char* source = "";   ///< source file and
    int line = 0;              ///< line that a stop is recorded with
    const char* dumpName = ""; ///< in the names of picture dumps

    const char* start = nullptr;      ///< before the condition is tested; a format for both planes' addresses
    const char* opening = nullptr;    ///< once the condition holds; a format for both planes' addresses
    const char* matched = nullptr;    ///< after the opening
    const char* completion = nullptr; ///< at the end

    Writes writes = Writes::EveryPixel;
    bool testsStop = true; ///< whether its rows end at a stop request and report their percentage
};

} // namespace orvela
