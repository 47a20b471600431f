#include "PluginEntry/Module/DoStart.h"

#include "GUI/Windows/CDlgMainImpl.h"
#include "PluginEntry/Exchange/PictureSession.h"
#include "PluginEntry/Module/ModuleCall.h"
#include "PluginEntry/Module/OrvelaApplication.h"
#include "Settings/SettingsStore.h"
#include "Update/CheckVersion.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

using namespace orvela;

namespace {

int threadCount() {
    return openSettings().value(QStringLiteral("NoThreads"), -1).toInt();
}

bool runWindows(void* hostWindow, PictureSession& session) {
    Log::log(LogLevel::Debug, "Now starting the GUI...");
    try {
        return CDlgMainImpl(hostWindow, &session.input(), &session.output()).run();
    } catch (...) {
        std::throw_with_nested(
            CGenericEx(QStringLiteral("Unable to display the GUI."), "PluginMain", __LINE__));
    }
}

void* windowOf(const host::FilterRecord& record) {
    const host::PlatformData* platform = record.platformData;
    return platform ? platform->hostWindow : nullptr;
}

void work(host::FilterRecord* record, std::int16_t* result) {
    PictureSession session(record, result);
    if (runWindows(windowOf(*record), session))
        session.writeBack();
    else
        *result = host::UserCanceledErr;
}

} // namespace

void DoStart() {
    const ModuleCall call = ModuleCall::current(); // another one may come while a window is open
    const LogScope scope(LogLevel::Debug, "DoStart.");
    OrvelaApplication application(threadCount());
    CheckVersion update;
    update.checkVersion();
    application.execute([&call] { work(call.record, call.result); });
}
