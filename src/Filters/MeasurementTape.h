#pragma once

#include "Settings/CUserParams.h"

#include <map>
#include <span>
#include <vector>

namespace orvela {

/// What the measurements of a run over a whole picture found. A run over a part or a reduced copy of it plays
/// it, so that its filters work by the statistics of the whole picture.
class MeasurementTape {
public:
    /// @param picturePixels  of the whole picture
    explicit MeasurementTape(std::int32_t picturePixels = 0) : mPicturePixels(picturePixels) {}

    std::int32_t picturePixels() const { return mPicturePixels; }
    /// Whether something was asked for that is not on the tape: the recorded run had other tasks.
    bool hasMissed() const { return mMissed; }

    /// Moves on to a task of the run: `step` counts its tasks, run or not.
    void moveTo(int step, const char* task);

    /// Keeps what the present task has measured.
    void record(const CUserParams& found);

    /// Gives `params` what the task measured when it was recorded: the four histograms and the statistics
    /// that the task writes. False when there is no record.
    bool play(CUserParams& params);

    /// The same for numbers that the task has measured for itself alone; as many are played as were recorded.
    void record(std::span<const float> numbers);
    bool play(std::span<float> numbers);

private:
    std::map<std::pair<int, int>, CUserParams> mFound; ///< by step and how many measurements it made before
    std::map<std::pair<int, int>, std::vector<float>> mNumbers;
    std::int32_t mPicturePixels;
    bool mMissed = false;
    std::pair<int, int> mPlace;
    const char* mTask = "";
};

} // namespace orvela
