#include "Core/CThreadedCore_Orvela.h"

#include "Utility/Logger.h"

#include <QThread>

using namespace orvela;

namespace {

// Fixed; up to 36 steps are announced, so the last step numbers exceed it.
constexpr int kTotalSteps = 34;

} // namespace

bool CThreadedCore_Orvela::doRun() {
    Log::log(LogLevel::Debug, "CThreadedCore_Orvela::doRun The core is now creating it's Original plane.");
    Log::log(LogLevel::Debug, "Thread (CThreadedCore_Orvela): %p %d",
             static_cast<void*>(QThread::currentThread()),
             static_cast<int>(reinterpret_cast<quintptr>(QThread::currentThreadId())));
    mParams.Final_Touch_Mode_Enabled = false;
    mTotalSteps = kTotalSteps;
    Log::log(LogLevel::Debug, "  Starting processing: Totalsteps:%d", mTotalSteps);
    for (const PipelineStep& step : PipelineTable::mainSteps()) {
        if (step.logBefore)
            Log::log(LogLevel::Debug, "%s", step.logBefore);
        if (!step.announced || step.announced(mParams))
            announce(mCurrentStep++, mTotalSteps, step.label, step.title);
        for (const PipelineTask& task : step.tasks)
            runTask(task, step.title);
        if (step.logAfter)
            Log::log(LogLevel::Debug, "%s", step.logAfter);
    }
    return true;
}
