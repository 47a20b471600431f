#pragma once

class CARGBPlaneProxy;

namespace orvela {

class RowScheduler;

/// What the tasks of one run share beside its parameters and planes. Runs with contexts of their own can go
/// on side by side in one process, each on its thread.
struct RunContext {
    /// Source of the host's unprocessed pixels; null for the process-wide one.
    const CARGBPlaneProxy* proxy = nullptr;
    /// The threads that passes over rows use; null for as many as there are processors.
    RowScheduler* scheduler = nullptr;
    /// Whether the picture is dumped to a file after every filter.
    bool dumpsPictures = false;
};

} // namespace orvela
