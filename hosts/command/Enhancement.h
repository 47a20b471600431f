#pragma once

#include "command/ProgressLine.h"
#include "command/SettingOptions.h"
#include "command/StopSignals.h"
#include "common/Photograph.h"

#include <filesystem>
#include <optional>

namespace orvela {

/// The engine has given up a photograph, for want of memory.
class EngineFailure : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Where the steps of a run are to be shown.
struct TraceOptions {
    std::filesystem::path folder;
    bool overwrite = false;
};

/// Runs the pipelines over a photograph in memory the way a host does: through a filter record.
/// @return the result; none when a signal stopped the run
/// @throws EngineFailure, CGenericEx, TargetError (the trace cannot be written)
std::optional<Photograph> enhance(Photograph photograph, const RunSettings& settings,
                                  const std::optional<TraceOptions>& trace, StopSignals& signals,
                                  ProgressLine& progress);

} // namespace orvela
