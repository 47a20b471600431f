#include "Settings/FactoryPresets.h"

#include "Settings/CUserParams.h"
#include "Settings/ModeTable.h"
#include "Settings/PresetConversion.h"
#include "Utility/DebugBoxes.h"

#include <QCoreApplication>

namespace orvela {

namespace {

// Null for a mode without a factory preset.
const char* nameOf(EGUIMode mode) {
    const ModeDescription* description = ModeTable::find(mode);
    return description ? description->presetName : nullptr;
}

void note(const QString& text) {
    DebugBoxes::warningBox(DebugBoxes::mainWindow(), QCoreApplication::translate("CPresetStore", "Note:"),
                           text);
}

} // namespace

namespace FactoryPresets {

bool isFactoryMode(EGUIMode mode) {
    return nameOf(mode) != nullptr;
}

QStringList names() {
    QStringList names;
    for (const ModeDescription& mode : ModeTable::all())
        if (mode.presetName)
            names.append(QString::fromLatin1(mode.presetName));
    return names;
}

bool isFactoryPresetName(const QString& name) {
    return names().contains(name);
}

bool isFactoryPreset(EGUIMode mode, const QString& name) {
    return mode == Mode_Advanced && isFactoryPresetName(name);
}

PresetContent contentOf(const QString& name) {
    const CUserParamsPhotoshop factory(factoryPresetMode(name));
    return PresetConversion::contentOf(Mode_Advanced, factory.mSliderParams);
}

EGUIMode factoryPresetMode(const QString& name) {
    for (const ModeDescription& mode : ModeTable::all())
        if (mode.presetName && name == QLatin1String(mode.presetName))
            return mode.mode;
    note(QCoreApplication::translate("CPresetStore", "Unknown preset:") + name);
    return Mode_Portrait;
}

QString factoryPresetName(EGUIMode mode) {
    if (const char* name = nameOf(mode))
        return QString::fromLatin1(name);
    note(QCoreApplication::translate("CPresetStore", "Unknown preset:%1").arg(static_cast<int>(mode)));
    return QString(QChar(0xFFFF));
}

} // namespace FactoryPresets

} // namespace orvela
