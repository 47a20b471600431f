#pragma once

#include <QString>

#include <functional>

namespace orvela {

/// Who waits for a run: is told how far it is, on the thread of the run, and can stop it.
class RunWatch {
public:
    virtual ~RunWatch() = default;

    /// A step of `total` begins, counted from 0.
    virtual void step(int step, int total, const QString& title) = 0;

    /// Percentage of the current step.
    virtual void percent(int percent) = 0;

    /// From now on `stop` ends the run; it may be called on any thread, at once when the run was asked to
    /// stop before. Null: it can no longer be stopped.
    virtual void setStop(const std::function<void()>& stop) = 0;

    /// Whether the run was asked to stop.
    virtual bool stopRequested() const = 0;
};

} // namespace orvela
