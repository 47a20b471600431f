#pragma once

#include <functional>

class CARGBPlaneProxy;

namespace orvela {

class MeasurementTape;

/// What the tasks of one run share beside its parameters and planes; nothing of a run is shared by the whole
/// process, so that several can go on side by side, each on a thread of its own. Their passes over rows use
/// the threads of the scheduler that the run executes in (RowScheduler::execute).
struct RunContext {
    /// Source of the host's unprocessed pixels; null for the process-wide one.
    const CARGBPlaneProxy* proxy = nullptr;
    /// Whether the picture is dumped to a file after every filter.
    bool dumpsPictures = false;
    /// Where the run records what it measures, or finds what was measured of a whole picture; null for
    /// neither.
    MeasurementTape* tape = nullptr;
    /// Whether it plays the tape: the planes hold a part or a reduced copy of the picture.
    bool playsTape = false;
    /// Called at the rows of tasks that test no stop, from any thread; null for nothing.
    std::function<void()> onSilentRow = nullptr;
};

} // namespace orvela
