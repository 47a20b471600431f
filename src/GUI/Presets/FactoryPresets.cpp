#include "GUI/Presets/FactoryPresets.h"

#include "Utility/DebugBoxes.h"
#include "Utility/ModeTable.h"

#include <QCoreApplication>

namespace FactoryPresets {

EGUIMode factoryPresetMode(const QString& name) {
    for (const ModeDescription& mode : ModeTable::all())
        if (mode.presetName && name == QLatin1String(mode.presetName))
            return mode.mode;
    DebugBoxes::warningBox(nullptr, QCoreApplication::translate("CPresetStore", "Note:"),
                           QCoreApplication::translate("CPresetStore", "Unknown preset:") + name);
    return Mode_Portrait;
}

} // namespace FactoryPresets
