#pragma once

#include "Core/PipelineTable.h"
#include "Settings/CUserParams.h"
#include "Utility/CARGBPlane.h"

#include <QElapsedTimer>
#include <QObject>
#include <QSemaphore>

#include <atomic>
#include <functional>
#include <memory>
#include <vector>

class QRect;
class QThread;

namespace orvela {

/// What one task of a run did.
struct TaskReport {
    const char* name;      ///< class name of the task
    const char* stepTitle; ///< of its step, for people
    TaskKind kind;
    TaskOutcome outcome;
    Failure failure;
    double milliseconds;
};

} // namespace orvela

/// Runs one enhancement of a whole image: a fixed sequence of tasks, announced step by step.
///
/// The run executes on the thread that calls run(), whichever it is. Pending events of that thread are
/// processed at every announcement and while rows are worked on, so that its handlers can stop the run. One
/// run at a time; other cores may run on other threads meanwhile.
class CThreadedCore : public QObject {
    Q_OBJECT

public:
    /// The planes are not owned. After a run both hold the result.
    CThreadedCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* parent = nullptr);
    ~CThreadedCore() override;

    /// Copies the parameters for the next run, which also forgets an earlier stop.
    void setParams(const CUserParamsPhotoshop& params);
    /// The parameters as the last run left them.
    const CUserParamsPhotoshop& params() const { return mParams; }

    /// Where the filters of the next runs find the host's unprocessed picture; null for the process-wide
    /// proxy.
    void setProxy(const CARGBPlaneProxy* proxy) { mContext.proxy = proxy; }

    /// Has the next runs record what they measure, each over what was recorded before; null ends it.
    void recordTape(orvela::MeasurementTape* tape);
    /// Makes the next runs drafts: the planes hold a part or a reduced copy of the picture that the tape was
    /// recorded of.
    void playTape(orvela::MeasurementTape& tape);

    /// Runs the pipeline; the result is told by lastProcessingDone() and the last announcement, "All Done" or
    /// "Failed". A stopped run walks on through its announcements and ends with "All Done".
    void run();

    /// Asks the run to end: no task that tests it begins another row. From any thread.
    void stop();

    /// What the step that was announced last does, in words for people.
    const char* stepTitle() const { return mStepTitle; }

    /// Releases the permit that the run waits for after each stepDone().
    void stepHandled();

    /// Calls `observer` after every task, on the thread of the run, before the next one starts.
    void setObserver(std::function<void(const orvela::TaskReport&)> observer);

    /// What the tasks of the last run did, in their order; those that the run left out are missing.
    const std::vector<orvela::TaskReport>& reports() const { return mReports; }

    /// Why the last run ended with "Failed".
    const orvela::Failure& failure() const { return mFailure; }

    /// A copy of the picture as it stands between two tasks, for an observer or a receiver of stepDone(); to
    /// be asked on the thread of the run. See orvela::takeSnapshot() for its part and reduction.
    /// @throws CGenericEx when the memory cannot be had
    std::unique_ptr<CARGBPlane> snapshot() const;
    std::unique_ptr<CARGBPlane> snapshot(const QRect& area, int reduction) const;

Q_SIGNALS:
    /// Step number, number of steps, name of the step that starts now. The receiver answers with
    /// stepHandled().
    void stepDone(int Step, int TotalSteps, QString NextStepName = QString());
    void percentDone(int Percent);
    void finished();
    void started();
    void terminated();

public Q_SLOTS:
    /// True only after a run that ended with "All Done".
    bool lastProcessingDone() const;
    /// Emits percentDone() unless the value is the last one sent.
    void emitPercentDone(int percent);

protected:
    /// The pipeline; true when it reached its end.
    virtual bool doRun() = 0;

    /// Emits stepDone(), processes events and waits until the step was handled.
    void announce(int step, int total, const char* name, const char* title);

    /// Makes, applies and destroys one task.
    void runTask(const orvela::PipelineTask& task, const char* stepTitle);

    CARGBPlane* mInPlane;
    CARGBPlane* mOutPlane;
    int mTotalSteps = 0;
    int mCurrentStep = 0;
    CUserParamsPhotoshop mParams;

private:
    bool runPipeline();
    bool guarded(const std::function<bool()>& action);
    void reportProgress(int percent);
    bool serveEvents();
    bool playsInstead(const orvela::PipelineTask& task, const TaskBase& made);
    void record(const orvela::PipelineTask& task, const TaskBase& made);

    QSemaphore mSemaphore;
    const char* mStepTitle = "";
    bool mLastProcessingDone = false;
    int mLastPercent = 0;
    std::atomic<int> mReportedPercent = 0; ///< latest percentage of any row
    QThread* mRunThread = nullptr;
    QElapsedTimer mSinceService;
    orvela::RunContext mContext;
    int mTaskNumber = 0;
    std::function<void(const orvela::TaskReport&)> mObserver;
    std::vector<orvela::TaskReport> mReports;
    orvela::Failure mFailure;
};
