#include "Core/CThreadedCore_FinalTouch.h"

#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

using namespace orvela;

namespace {
constexpr char kSource[] = "Core/CThreadedCore_FinalTouch";
}

CThreadedCore_FinalTouch::CThreadedCore_FinalTouch(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* parent)
    : CThreadedCore(inPlane, outPlane, parent) {
    try {
        mOriginalPlane = std::make_unique<CARGBPlane>(*inPlane, QString());
    } catch (...) {
        Log::log(LogLevel::Error, "Unable to create the Original plane from Input plane.");
        std::throw_with_nested(COutOfMemoryEx(
            QStringLiteral("Unable to create the Original plane from Input plane."), kSource, 11));
    }
}

CThreadedCore_FinalTouch::~CThreadedCore_FinalTouch() = default;

bool CThreadedCore_FinalTouch::doRun() {
    Log::log(LogLevel::Info, "The core is now creating it's Original plane.");
    mParams.Final_Touch_Mode_Enabled = true;
    try {
        mInPlane->copyFrom(*mOriginalPlane);
        mOutPlane->copyFrom(*mOriginalPlane);
        for (const PipelineTask& task : PipelineTable::finalTouchTasks())
            runTask(task, QT_TRANSLATE_NOOP("PipelineTable", "Final touch"));
    } catch (...) {
        Log::scopeExit(LogLevel::Error, "Unable to complete the 16th filters block.");
        std::throw_with_nested(
            CGenericEx(QStringLiteral("Unable to complete the 16th filters block."), kSource, 168));
    }
    return true;
}
