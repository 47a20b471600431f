#pragma once

#include "Core/CThreadedCore.h"

#include <filesystem>
#include <memory>

namespace orvela {

/// Shows what each step of a run did: after every filter that changed the picture a numbered PNG, and beside
/// it the statistics and histograms that hold from there on, as JSON.
class TraceFolder {
public:
    /// @param original  the picture before the run
    /// @throws TargetError when the folder cannot be made, or holds files and `overwrite` is false
    TraceFolder(std::filesystem::path folder, bool overwrite, const CARGBPlane& original);
    ~TraceFolder();

    /// To be called after each task of the run.
    /// @throws TargetError
    void taskDone(const TaskReport& report, const CThreadedCore& core);

private:
    std::filesystem::path mFolder;
    bool mOverwrite;
    int mNumber = 0;
    std::unique_ptr<CARGBPlane> mLast;
};

} // namespace orvela
