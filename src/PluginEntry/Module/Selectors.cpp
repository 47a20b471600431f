#include "PluginEntry/Module/Selectors.h"

#include "GUI/Windows/CDlgProgramInfosImpl.h"
#include "PluginEntry/Module/DoStart.h"
#include "PluginEntry/Module/EntrySetup.h"
#include "PluginEntry/Module/FailureBox.h"
#include "PluginEntry/Module/ModuleApplication.h"
#include "PluginEntry/Module/ModuleCall.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <limits>

namespace orvela {

namespace {

constexpr std::int64_t kBufferBytes = 27; // for each pixel, as the host is told
constexpr std::int64_t kNeededBytes = 9;  // for each pixel

// A failure of the action gets a text for the user, and keeps its cause.
template <typename Action>
void guarded(const char* text, std::int16_t code, int line, Action action) {
    std::int16_t* result = ModuleCall::current().result; // another call may come while a window is open
    try {
        action();
    } catch (...) {
        *result = code;
        std::throw_with_nested(CGenericEx(QString::fromLatin1(text), "PluginMain", line));
    }
}

void requireWindows() {
    if (!ModuleApplication::canShowWindows())
        throw CGenericEx(QStringLiteral("No window can be opened here."), "PluginMain", __LINE__);
}

void showAbout() {
    requireWindows();
    const ModuleApplication::Use use;
    CDlgProgramInfosImpl(nullptr).exec();
}

// As much of the bytes as the record's field can tell.
std::int32_t bytesFor(const host::Rect& area, std::int64_t perPixel) {
    const std::int64_t pixels = std::int64_t{area.right - area.left} * (area.bottom - area.top);
    return static_cast<std::int32_t>(
        std::min<std::int64_t>(perPixel * pixels, std::numeric_limits<std::int32_t>::max()));
}

void requestMemory() {
    host::FilterRecord& record = *ModuleCall::current().record;
    record.bufferSpace = bytesFor(record.filterRect, kBufferBytes);
    Log::log(LogLevel::Debug, "Memory info: Allowed=%d, Needed=%d", record.maxSpace,
             bytesFor(record.filterRect, kNeededBytes));
}

void start() {
    requireWindows();
    const ModuleApplication::Use use;
    DoStart();
}

void act(std::int16_t selector) {
    switch (selector) {
    case host::SelectorAbout:
        return guarded(QT_TRANSLATE_NOOP("PluginMain", "The was unable to create the About dialog."),
                       host::NoErr, __LINE__, showAbout);
    case host::SelectorParameters:
    case host::SelectorFinish:
        return;
    case host::SelectorPrepare:
        return guarded(QT_TRANSLATE_NOOP("PluginMain", "The plug-in was unable to prepare it's globals."),
                       host::NoErr, __LINE__, requestMemory);
    case host::SelectorStart:
        return guarded(
            QT_TRANSLATE_NOOP("PluginMain", "The plug-in was unable to run it's main processing method."),
            host::UserCanceledErr, __LINE__, start);
    case host::SelectorContinue:
        throw CGenericEx(
            QStringLiteral("An invalid selector was passed by Photoshop (filterSelectorContinue)."),
            "Unknown File", 0);
    default:
        *ModuleCall::current().result = host::FilterBadParameters;
        throw CGenericEx(QStringLiteral("An invalid selector was passed by Photoshop: %1").arg(selector),
                         "PluginMain", __LINE__);
    }
}

} // namespace

void handleSelector(std::int16_t selector, void* record, std::int16_t* result) {
    const EntrySetup setup;
    const LogScope scope(LogLevel::Debug, "PluginMain.");
    ModuleCall& call = ModuleCall::current();
    call.record = static_cast<host::FilterRecord*>(record);
    call.result = result;
    *result = host::NoErr;
    Log::log(LogLevel::Info, "Selector value is %d.", selector);
    try {
        act(selector);
    } catch (...) {
        const ModuleApplication::Use use;
        showFailure(result);
    }
}

} // namespace orvela
