#pragma once

#include <cstdint>
#include <optional>

class CARGBPlaneProxy;

namespace orvela {

class MeasurementTape;

/// What a run over a part or a reduced copy of a picture stands for.
struct Excerpt {
    std::int32_t picturePixels = 0; ///< of the whole picture
    int reduction = 1;              ///< its pixels, in a row, that became one
};

/// What the tasks of one run share beside its parameters and planes; nothing of a run is shared by the whole
/// process, so that several can go on side by side, each on a thread of its own. Their passes over rows use
/// the threads of the scheduler that the run executes in (RowScheduler::execute).
struct RunContext {
    /// Source of the host's unprocessed pixels; null for the process-wide one.
    const CARGBPlaneProxy* proxy = nullptr;
    /// Whether the picture is dumped to a file after every filter.
    bool dumpsPictures = false;
    /// None for a run over a whole picture.
    std::optional<Excerpt> excerpt;
    /// Recorded by a run over a whole picture, played by one over an excerpt; null for neither.
    MeasurementTape* tape = nullptr;
};

} // namespace orvela
