#include "Settings/FactoryPresets.h"

#include "Settings/CUserParams.h"
#include "Settings/ModeTable.h"
#include "Settings/PresetConversion.h"
#include "Utility/DebugBoxes.h"

#include <QCoreApplication>

#include <algorithm>

namespace orvela {

namespace {

constexpr EGUIMode kModes[] = {Mode_Automatic,  Mode_AutomaticPro, Mode_Portrait,  Mode_PortraitPro,
                               Mode_Landscape,  Mode_LandscapePro, Mode_Macro,     Mode_MacroPro,
                               Mode_AutoLevels, Mode_AutoContrast, Mode_AutoColor, Mode_AutoSaturation};

QString nameOf(EGUIMode mode) {
    return QString::fromLatin1(ModeTable::find(mode)->presetName);
}

void note(const QString& text) {
    DebugBoxes::warningBox(DebugBoxes::mainWindow(), QCoreApplication::translate("CPresetStore", "Note:"),
                           text);
}

} // namespace

namespace FactoryPresets {

bool isFactoryMode(EGUIMode mode) {
    return std::find(std::begin(kModes), std::end(kModes), mode) != std::end(kModes);
}

QStringList names() {
    QStringList names;
    for (const EGUIMode mode : kModes)
        names.append(nameOf(mode));
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
    return PresetConversion::shownContentOf(Mode_Advanced, factory.mSliderParams);
}

EGUIMode factoryPresetMode(const QString& name) {
    for (const EGUIMode mode : kModes)
        if (name == nameOf(mode))
            return mode;
    note(QCoreApplication::translate("CPresetStore", "Unknown preset:") + name);
    return Mode_Portrait;
}

QString factoryPresetName(EGUIMode mode) {
    if (isFactoryMode(mode))
        return nameOf(mode);
    note(QCoreApplication::translate("CPresetStore", "Unknown preset:%1").arg(static_cast<int>(mode)));
    return QString(QChar(0xFFFF));
}

} // namespace FactoryPresets

} // namespace orvela
