#pragma once

#include "Filters/TaskBase.h"

#include <algorithm>

/// A task that turns what the histograms left in the parameters into factors for later filters. It has no row
/// pass, changes no plane and, unlike the other tasks, lets its failure reach the caller.
class ISmartAnalyzer : public TaskBase {
public:
    /// The pointers are not owned and not checked here.
    ISmartAnalyzer(const orvela::RunContext& context, CUserParams* params, CARGBPlane* inPlane)
        : TaskBase(context, params, inPlane) {}

    /// RunAnalyzer(), then true.
    bool Apply() override;

    /// Checks the pointers, prepares and analyzes.
    /// @throws CBadPtrEx without params or input plane; CGenericEx when the analysis fails
    void RunAnalyzer();

protected:
    virtual void Prepare() = 0;
    virtual void Analyze() = 0;

    /// Pixels of the plane that shares are taken over; 1 for an empty one, whose masses are 0.
    int pixels() const { return std::max(1, picturePixels()); }
};
