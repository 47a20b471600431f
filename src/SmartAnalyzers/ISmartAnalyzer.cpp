#include "SmartAnalyzers/ISmartAnalyzer.h"

#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

using namespace orvela;

namespace {
constexpr char kSource[] = "SmartAnalyzers/ISmartAnalyzer";
}

bool ISmartAnalyzer::Apply() {
    try {
        RunAnalyzer();
    } catch (...) {
        setOutcome(TaskOutcome::Failed, Failure::current());
        throw;
    }
    setOutcome(TaskOutcome::Applied);
    return true;
}

void ISmartAnalyzer::RunAnalyzer() {
    if (!mParams) {
        Log::log(LogLevel::Error, "The User Settings object was invalid.");
        throw CBadPtrEx(QStringLiteral(QT_TRANSLATE_NOOP("Failure", "The User Settings object was invalid.")),
                        kSource, 26);
    }
    if (!mInPlane) {
        Log::log(LogLevel::Error, "The Input plane was invalid!");
        throw CBadPtrEx(
            QStringLiteral(QT_TRANSLATE_NOOP("Failure", "The analyzer has an invalid Input plane.")), kSource,
            31);
    }
    try {
        Prepare();
        Analyze();
    } catch (...) {
        Log::log(LogLevel::Error, "An error occured while running a SmartAnalyzer object.");
        std::throw_with_nested(CGenericEx(
            QStringLiteral("An error occured while running a SmartAnalyzer object."), kSource, 40));
    }
}
