#include "Core/CThreadedCore.h"

#include "Core/Snapshot.h"
#include "Filters/MeasurementTape.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QCoreApplication>
#include <QThread>

using namespace orvela;

namespace {

// Events and percentages are served at most this often while rows are worked on: often enough for a stop to
// be felt at once, seldom enough to cost a pass nothing.
constexpr qint64 kServiceMilliseconds = 8;

bool isMeasurement(const PipelineTask& task, const TaskBase& made) {
    return task.kind == TaskKind::Histogram || made.onlyMeasures();
}

} // namespace

CThreadedCore::CThreadedCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* parent)
    : QObject(parent), mInPlane(inPlane), mOutPlane(outPlane) {}

CThreadedCore::~CThreadedCore() = default;

void CThreadedCore::setParams(const CUserParamsPhotoshop& params) {
    mParams = params;
}

void CThreadedCore::run() {
    const LogDepth ownDepth;
    mContext.dumpsPictures =
        !mContext.playsTape &&
        openSettings().value(PresetTree::guiKey(QStringLiteral("dumpImageAfterFile"))).toInt() != 0;
    mTotalSteps = 0;
    mCurrentStep = 0;
    mRunThread = QThread::currentThread();
    mSinceService.start();
    mParams.mProgressCallback = [this](int percent) { reportProgress(percent); };
    mContext.onSilentRow = [this] { serveEvents(); };
    mLastProcessingDone = false;
    mReports.clear();
    mTaskNumber = 0;
    mFailure = {};
    if (mContext.tape && !mContext.playsTape)
        *mContext.tape = MeasurementTape(mInPlane->pixelCount());

    announce(0, 1, "Duplicating Input Plane", QT_TRANSLATE_NOOP("PipelineTable", "Copying the picture"));
    emitPercentDone(0);
    if (runPipeline()) {
        announce(1, 1, "All Done", QT_TRANSLATE_NOOP("PipelineTable", "Done"));
        emitPercentDone(100);
        mLastProcessingDone = true;
    } else {
        announce(0, 1, "Failed", QT_TRANSLATE_NOOP("PipelineTable", "Failed"));
        emitPercentDone(0);
    }
}

bool CThreadedCore::runPipeline() {
    const bool reachedEnd = guarded([this] {
        mOutPlane->copyFrom(*mInPlane);
        return doRun();
    });
    // Filters hand their result on by exchanging the planes; both are to hold it.
    const bool bothHoldIt = guarded([this] {
        mOutPlane->copyFrom(*mInPlane);
        return true;
    });
    return reachedEnd && bothHoldIt;
}

bool CThreadedCore::guarded(const std::function<bool()>& action) {
    try {
        return action();
    } catch (...) {
        mFailure = Failure::current();
    }
    Log::log(LogLevel::Info, "%s %d", "Core/CThreadedCore", 50);
    ExceptionStack::clear();
    return false;
}

std::unique_ptr<CARGBPlane> CThreadedCore::snapshot() const {
    return snapshot(QRect(0, 0, mInPlane->width(), mInPlane->height()), 1);
}

std::unique_ptr<CARGBPlane> CThreadedCore::snapshot(const QRect& area, int reduction) const {
    return takeSnapshot(*mInPlane, area, reduction);
}

void CThreadedCore::recordTape(MeasurementTape* tape) {
    mContext.tape = tape;
    mContext.playsTape = false;
}

void CThreadedCore::playTape(MeasurementTape& tape) {
    mContext.tape = &tape;
    mContext.playsTape = true;
}

void CThreadedCore::stop() {
    mParams.mCancelRequested = true;
    mSemaphore.release();
}

void CThreadedCore::stepHandled() {
    mSemaphore.release();
}

void CThreadedCore::setObserver(std::function<void(const TaskReport&)> observer) {
    mObserver = std::move(observer);
}

bool CThreadedCore::lastProcessingDone() const {
    return mLastProcessingDone;
}

void CThreadedCore::emitPercentDone(int percent) {
    if (percent == mLastPercent)
        return;
    mLastPercent = percent;
    Q_EMIT percentDone(percent);
}

void CThreadedCore::announce(int step, int total, const char* name, const char* title) {
    mStepTitle = title;
    Q_EMIT stepDone(step, total, QString::fromLatin1(name));
    QCoreApplication::processEvents();
    // The permit may come from a handler on this very thread, so waiting must let its events through.
    while (!mSemaphore.tryAcquire(1, 10))
        QCoreApplication::processEvents();
}

void CThreadedCore::runTask(const PipelineTask& task, const char* stepTitle) {
    if (mContext.tape)
        mContext.tape->moveTo(mTaskNumber++, task.name);
    if (!task.condition || task.condition(mParams)) {
        QElapsedTimer timer;
        timer.start();
        const std::unique_ptr<TaskBase> made = task.make(mContext, &mParams, mInPlane, mOutPlane);
        const auto report = [&] {
            mReports.push_back({task.name, stepTitle, task.kind, made->outcome(), made->failure(),
                                static_cast<double>(timer.nsecsElapsed()) / 1e6});
            if (mObserver)
                mObserver(mReports.back());
        };
        try {
            if (!playsInstead(task, *made))
                made->Apply();
        } catch (...) { // an analyzer's failure ends the run
            report();
            throw;
        }
        record(task, *made);
        report();
    }
    if (task.afterwards)
        task.afterwards(mParams);
}

bool CThreadedCore::playsInstead(const PipelineTask& task, const TaskBase& made) {
    return mContext.playsTape && isMeasurement(task, made) && mContext.tape->play(mParams);
}

void CThreadedCore::record(const PipelineTask& task, const TaskBase& made) {
    if (mContext.tape && !mContext.playsTape && isMeasurement(task, made))
        mContext.tape->record(mParams);
}

// Called for every row, from any thread. Only the thread of the run processes events and emits; the others
// leave their percentage for it.
void CThreadedCore::reportProgress(int percent) {
    mReportedPercent.store(percent, std::memory_order_relaxed);
    if (serveEvents())
        emitPercentDone(mReportedPercent.load(std::memory_order_relaxed));
}

// Now and then only, so that rows cost no more for it.
bool CThreadedCore::serveEvents() {
    if (QThread::currentThread() != mRunThread || !mSinceService.hasExpired(kServiceMilliseconds))
        return false;
    QCoreApplication::processEvents();
    mSinceService.start();
    return true;
}
