#pragma once

#include "Settings/CUserParams.h"
#include "Utility/CARGBPlane.h"

#include <QByteArray>

#include <cstdint>

/// One unit of image work: a filter, a histogram or an analyzer. Created for its step, applied once,
/// destroyed.
///
/// Apply() runs PreApply(), a pass of ApplyRow() over the rows that the scheduler spreads over the
/// processors, PostApply() and onSuccess(), in this order; a phase that returns false or throws ends the run.
class TaskBase {
public:
    TaskBase() = default;
    virtual ~TaskBase() = default;
    TaskBase(const TaskBase&) = delete;
    TaskBase& operator=(const TaskBase&) = delete;

    /// Runs the phases. False when one of them stopped the run or failed; never throws for filters and
    /// histograms.
    virtual bool Apply();

    const QByteArray& name() const { return mName; }

protected:
    virtual void onSuccess() {}
    /// Decides whether the task applies and prepares its coefficients; false is a quiet skip.
    virtual bool PreApply() { return true; }
    /// Processes one row; runs on any thread, several rows at once.
    virtual void ApplyRow(std::uint32_t row);
    /// Completes the task; false is a quiet stop.
    virtual bool PostApply() { return true; }
    /// Called at the end of a run that did not reach its end.
    virtual void onStopped() {}

    /// Calls ApplyRow(i * mVertStep) for the indices i from mVertStart, (mVertEnd - mVertStart) / mVertStep
    /// of them. A range that ends before it starts is empty.
    bool DoApplyParallel();

    std::uint32_t mVertStart = 0;
    std::uint32_t mVertEnd = 0;
    std::uint32_t mVertStep = 1;
    QByteArray mName; ///< for the names of debug dumps; empty unless set

private:
    bool runPhases();
};

/// Start of every row operation: ends the pass when a stop was requested, then reports the row's percentage.
/// @param source, line  the row operation's own place, for the failure's record
/// @throws CGenericEx "User canceled."
void beginRow(const CUserParams& params, const CARGBPlane& inPlane, std::uint32_t row, const char* source,
              int line);
