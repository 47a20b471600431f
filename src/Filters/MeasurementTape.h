#pragma once

#include "Settings/CUserParams.h"

#include <map>
#include <memory>

namespace orvela {

/// What the measurements of a run over a whole picture found. A run over a part or a reduced copy of it plays
/// it, so that its filters work by the statistics of the whole picture.
class MeasurementTape {
public:
    /// Moves on to a task of the run: `step` counts its tasks, run or not.
    void moveTo(int step, const char* task);

    /// Keeps what the present task has measured.
    void record(const CUserParams& found);

    /// Gives `params` what the task measured when it was recorded: the four histograms and the statistics
    /// that the task writes. False when there is no record.
    bool play(CUserParams& params);

private:
    std::map<std::pair<int, int>, CUserParams> mFound; ///< by step and how many measurements it made before
    std::pair<int, int> mPlace;
    const char* mTask = "";
};

} // namespace orvela
