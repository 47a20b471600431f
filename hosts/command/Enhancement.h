#pragma once

#include "command/ProgressLine.h"
#include "command/SettingOptions.h"
#include "command/StopSignals.h"
#include "files/Photograph.h"

#include <filesystem>
#include <optional>
#include <stdexcept>
#include <string>

namespace orvela {

/// The engine could not enhance a photograph, or not with every step that applies.
class EngineFailure : public std::runtime_error {
public:
    EngineFailure(const std::string& text, bool outOfMemory)
        : std::runtime_error(text), mOutOfMemory(outOfMemory) {}

    bool isOutOfMemory() const { return mOutOfMemory; }

private:
    bool mOutOfMemory;
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
