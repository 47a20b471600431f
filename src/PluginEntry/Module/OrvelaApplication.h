#pragma once

#include "Utility/RowScheduler.h"

/// The threads of one start of the filter.
class OrvelaApplication {
public:
    /// @param threads  their number; below 1: as many as the machine has processors
    explicit OrvelaApplication(int threads);

    /// Calls `action`, whose passes run on these threads.
    void execute(const std::function<void()>& action) { mScheduler.execute(action); }

private:
    orvela::RowScheduler mScheduler;
};
