#include "GUI/Presets/StoreWriting.h"

#include "Utility/DebugBoxes.h"
#include "Utility/Logger.h"

#include <QCoreApplication>

namespace orvela {

namespace StoreWriting {

bool commit(const SettingsEdit& edit, Cause cause) {
    static bool warned = false;
    try {
        edit.commit();
        warned = false;
        return true;
    } catch (const SettingsError& error) {
        Log::log(LogLevel::Warning, "%s", error.what());
        if (cause == Cause::User || !warned)
            DebugBoxes::warningBox(
                DebugBoxes::mainWindow(), QCoreApplication::translate("CPresetStore", "Warning"),
                error.shown() + QLatin1Char('\n') +
                    QCoreApplication::translate("CPresetStore", "Make sure that its folder has room and that "
                                                                "you may write there. Your pictures are not "
                                                                "affected."));
        warned = true;
        return false;
    }
}

} // namespace StoreWriting

} // namespace orvela
