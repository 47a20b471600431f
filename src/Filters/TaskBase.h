#pragma once

#include "Filters/RunContext.h"
#include "Filters/TaskDescription.h"
#include "Settings/CUserParams.h"
#include "Utility/CARGBPlane.h"

#include <cstdint>
#include <experimental/propagate_const>
#include <functional>
#include <span>

class TaskBase;

namespace orvela {

/// What became of a task.
enum class TaskOutcome {
    Applied,
    Skipped,   ///< its condition did not hold
    Cancelled, ///< by a stop request
    Failed,    ///< see TaskBase::failure()
};

/// Why a task or a run failed.
struct Failure {
    QString cause; ///< in words
    bool outOfMemory = false;

    /// From the exception that is being handled. Where even the words find no memory, they are missing.
    static Failure current() noexcept;
};

/// A pointer to what a task works on but does not own; a constant task cannot change it.
template <typename T>
using Borrowed = std::experimental::propagate_const<T*>;

/// Neighbouring rows of a pass, for one thread. Going over them ends with an exception at a stop request and
/// reports each row's percentage.
class RowBand {
public:
    class Iterator {
    public:
        Iterator(const RowBand& band, std::uint32_t index) : mBand(&band), mIndex(index) {}
        std::uint32_t operator*() const { return mBand->enter(mIndex); }
        Iterator& operator++() {
            ++mIndex;
            return *this;
        }
        bool operator!=(const Iterator& other) const { return mIndex != other.mIndex; }

    private:
        const RowBand* mBand;
        std::uint32_t mIndex;
    };

    /// @param first, last  indices of the pass, `last` excluded
    RowBand(TaskBase& task, std::uint32_t first, std::uint32_t last)
        : mTask(task), mFirst(first), mLast(last) {}

    Iterator begin() const { return {*this, mFirst}; }
    Iterator end() const { return {*this, mLast}; }

private:
    std::uint32_t enter(std::uint32_t index) const;

    TaskBase& mTask;
    std::uint32_t mFirst;
    std::uint32_t mLast;
};

} // namespace orvela

/// One unit of image work: a filter, a histogram or an analyzer. Created for its step, applied once,
/// destroyed. A task states its condition (applies), its numbers (setUp), its formula (ApplyRow) and its
/// texts (description); the frame does the rest.
///
/// Apply() runs PreApply(), a pass over the rows in bands that the scheduler spreads over the processors,
/// PostApply() and onSuccess(), in this order; a phase that returns false or throws ends the run.
class TaskBase {
public:
    virtual ~TaskBase() = default;
    TaskBase(const TaskBase&) = delete;
    TaskBase& operator=(const TaskBase&) = delete;

    /// Runs the phases. True when the task was applied; see outcome() otherwise. Never throws for filters and
    /// histograms.
    virtual bool Apply();

    /// What became of Apply().
    orvela::TaskOutcome outcome() const { return mOutcome; }
    /// Why it failed.
    const orvela::Failure& failure() const { return mFailure; }

    /// Whether it changes no pixel, by its description.
    bool onlyMeasures() const { return description().writes == orvela::Writes::Nothing; }

protected:
    /// The pointers are not owned and not checked.
    TaskBase(const orvela::RunContext& context, CUserParams* params, CARGBPlane* inPlane);

    virtual void onSuccess() {}
    /// Decides whether the task applies and prepares it, with the lines of its description; false is a quiet
    /// skip.
    virtual bool PreApply();
    /// Processes one row; runs on any thread, several rows at once.
    virtual void ApplyRow(std::uint32_t row);
    /// Completes the task; false is a quiet stop.
    virtual bool PostApply();

    /// The task's texts and promises.
    virtual const orvela::TaskDescription& description() const;
    /// The condition. May store flags that the decision settles for later tasks.
    virtual bool applies() { return true; }
    /// Turns parameters and statistics into the numbers and tables of the pass, and sets its rows. May store
    /// what it finds for later tasks.
    virtual void setUp() {}
    /// Processes the rows of a band by ApplyRow(); a task may work on neighbouring rows together instead.
    virtual void ApplyBand(const orvela::RowBand& band);
    /// What is left to do after the pass.
    virtual void complete() {}
    /// Called before the pass.
    virtual void onPass() {}
    /// Called before each row of the pass, on the thread that works on it.
    virtual void onRow(std::uint32_t) {}
    /// Called when Apply() ends early once the pass has begun.
    virtual void onStopped() {}

    /// Works through the bands of the indices from mVertStart, (mVertEnd - mVertStart) / mVertStep of them;
    /// the row of index i is i * mVertStep. A range that ends before it starts is empty.
    bool DoApplyParallel();
    /// Does a measurement that leaves histograms in the parameters, or takes what it found from the tape.
    void measured(const std::function<void()>& measure);
    /// The same for numbers that only this task knows: in an excerpt those of the whole picture take their
    /// place. False when these are not known.
    bool measured(std::span<float> numbers);
    /// Number of pixels of the whole picture, which thresholds grow with.
    std::int32_t picturePixels() const;
    /// The index after the last one of the pass.
    std::uint32_t passEnd() const;

    const orvela::RunContext mContext;
    orvela::Borrowed<CUserParams> mParams;
    orvela::Borrowed<CARGBPlane> mInPlane;
    std::uint32_t mVertStart = 0;
    std::uint32_t mVertEnd = 0;
    std::uint32_t mVertStep = 1;

    /// Does `action` and notes the outcome: what it returns, or its failure, which is not passed on.
    void guarded(const std::function<orvela::TaskOutcome()>& action);
    /// For tasks with a run of their own.
    void setOutcome(orvela::TaskOutcome outcome, const orvela::Failure& failure = {});

private:
    friend class orvela::RowBand;

    bool runPhases();
    void restore();
    void testStop() const;
    std::uint32_t enterRow(std::uint32_t index);
    void logPlanes(const char* text) const;
    /// The second plane whose address the opening lines show.
    virtual const CARGBPlane* outPlane() const { return nullptr; }

    orvela::TaskOutcome mOutcome = orvela::TaskOutcome::Skipped;
    orvela::Failure mFailure;
    bool mPassBegun = false;
};
