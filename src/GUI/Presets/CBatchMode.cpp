#include "GUI/Presets/CBatchMode.h"

#include "GUI/Presets/CPresetStore.h"
#include "GUI/Presets/StoreWriting.h"
#include "Platform/Keyboard.h"
#include "Settings/PaneTable.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Utility/DebugBoxes.h"
#include "Utility/Logger.h"

#include <QCoreApplication>
#include <QMessageBox>

using namespace orvela;

namespace {

const QString kEnabled = QStringLiteral("batchModeEnabled");

void write(const QString& key, const QVariant& value) {
    SettingsEdit edit;
    edit.set(key, value);
    StoreWriting::commit(edit, StoreWriting::Cause::Program);
}

} // namespace

CBatchMode& CBatchMode::instance() {
    static CBatchMode batchMode;
    return batchMode;
}

CBatchMode::CBatchMode() {
    const int shift = Keyboard::shiftState();
    Log::log(LogLevel::Debug, "SHIFT key state %d", shift);
    if (!shift)
        return;
    QMessageBox::information(static_cast<QWidget*>(DebugBoxes::mainWindow()),
                             QCoreApplication::translate("CBatchMode", "Batch Mode"),
                             QCoreApplication::translate("CBatchMode", "Batch mode is now off."),
                             QMessageBox::Ok);
    setBatchModeEnabled(false);
}

bool CBatchMode::isBatchModeEnabled() const {
    return PresetTree::switchOf(openSettings().value(PresetTree::guiKey(kEnabled)));
}

bool CBatchMode::replays() const {
    const auto mode = static_cast<EGUIMode>(batchMode());
    return isBatchModeEnabled() &&
           (CPresetStore::isFactoryMode(mode) || mode == Mode_Custom || !PaneTable::sliders(mode).empty());
}

void CBatchMode::setBatchModeEnabled(bool enabled) {
    write(PresetTree::guiKey(kEnabled), enabled);
}

int CBatchMode::batchMode() const {
    return openSettings().value(PresetTree::batchModeKey(), -1).toInt();
}

void CBatchMode::setBatchMode(int mode) {
    write(PresetTree::batchModeKey(), mode);
}
