#pragma once

#include "files/DeclaredPicture.h"
#include "run/RunWatch.h"
#include "run/SettingOptions.h"

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

/// What enhance() takes of memory, the photograph included.
/// @param threads  that it may use
ReadLimits needsOf(const RunSettings& settings, bool traced, int threads);

/// Runs the pipelines over a photograph in memory the way a host does: through a filter record.
/// @return the result; none when the run was stopped
/// @throws EngineFailure, CGenericEx, TargetError (the trace cannot be written)
std::optional<Photograph> enhance(Photograph photograph, const RunSettings& settings,
                                  const std::optional<TraceOptions>& trace, RunWatch& watch);

} // namespace orvela
