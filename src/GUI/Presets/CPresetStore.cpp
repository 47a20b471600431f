#include "GUI/Presets/CPresetStore.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Presets/StoreWriting.h"
#include "Settings/SettingsStore.h"
#include "Utility/DebugBoxes.h"
#include "Utility/Logger.h"

#include <QCheckBox>
#include <QCoreApplication>
#include <QMessageBox>

#include <algorithm>

using namespace orvela;

namespace {

// What the store says to the user, in its own context.
class Texts {
    Q_DECLARE_TR_FUNCTIONS(CPresetStore)
};

void warn(const QString& text) {
    DebugBoxes::warningBox(DebugBoxes::mainWindow(), Texts::tr("Warning"), text);
}

void warnOfMissing(const QString& object, const QString& what) {
    DebugBoxes::debugWarning(object + what, QStringLiteral("Debug Warning"));
}

void load(const QWidget* parent, const PresetSlider& stored) {
    auto* block = parent->findChild<COrvelaSliderBlockImpl*>(stored.object);
    if (!block)
        return warnOfMissing(stored.object, QStringLiteral(", the slider can not be found."));
    block->setEnabled(stored.enabled); // first, so that the state is announced before the value
    block->setValue(stored.value);
}

void load(const QWidget* parent, const PresetColor& stored) {
    if (auto* picker = parent->findChild<CColorPicker*>(stored.object))
        return picker->setColor(QColor(stored.red, stored.green, stored.blue));
    Log::log(LogLevel::Warning, "The color picker for preset (%s) can not be found.",
             stored.object.toUtf8().constData());
}

void load(const QWidget* parent, const PresetCheckBox& stored) {
    auto* box = parent->findChild<QCheckBox*>(stored.object);
    if (!box)
        return warnOfMissing(stored.object,
                             QStringLiteral(", the checkbox for this preset can not be found."));
    box->setChecked(stored.checked);
}

template <typename Control>
QList<Control*> namedControls(const QWidget* parent) {
    QList<Control*> controls = parent->findChildren<Control*>();
    controls.removeIf([](const Control* control) { return control->objectName().isEmpty(); });
    return controls;
}

bool mayOverwrite() {
    return QMessageBox::question(static_cast<QWidget*>(DebugBoxes::mainWindow()), Texts::tr("Warning"),
                                 Texts::tr("This preset already exists. Do you want to overwrite it?"),
                                 QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

} // namespace

namespace CPresetStore {

QString batchPresetName() {
    return PresetTree::batchPresetName();
}

QStringList listPresets(EGUIMode mode, bool excludeBatch) {
    return excludeBatch ? PresetTree::offeredNames(mode) : PresetTree::names(mode);
}

bool presetExists(EGUIMode mode, const QString& name) {
    return name != batchPresetName() && PresetTree::exists(mode, name);
}

bool hasPresets() {
    return PresetTree::hasPresets();
}

bool removePreset(EGUIMode mode, const QString& name) {
    SettingsEdit edit;
    PresetTree::remove(edit, mode, name);
    return StoreWriting::commit(edit, StoreWriting::Cause::User);
}

PresetContent contentOf(const QWidget* parent) {
    PresetContent content;
    for (const auto* block : namedControls<COrvelaSliderBlockImpl>(parent))
        content.sliders.append({block->objectName(), block->exactValue(), block->isEnabled()});
    for (const auto* picker : namedControls<CColorPicker>(parent)) {
        const QColor color = picker->color();
        content.colors.append({picker->objectName(), color.red(), color.green(), color.blue()});
    }
    for (const auto* box : namedControls<QCheckBox>(parent))
        content.checkBoxes.append({box->objectName(), box->isChecked()});
    return content;
}

void show(const QWidget* parent, const PresetContent& content) {
    for (const PresetSlider& slider : content.sliders)
        load(parent, slider);
    for (const PresetColor& color : content.colors)
        load(parent, color);
    for (const PresetCheckBox& box : content.checkBoxes)
        load(parent, box);
}

void loadPreset(QWidget* parent, EGUIMode mode, const QString& name) {
    if (const std::optional<PresetContent> stored = PresetTree::read(mode, name))
        show(parent, *stored);
}

void savePreset(QWidget* parent, EGUIMode mode, const QString& name, bool& saved, bool& isNew,
                bool askOverwrite) {
    saved = isNew = false;
    if (name.isEmpty())
        return warn(Texts::tr("A preset needs a name."));
    const bool asks = askOverwrite && presetExists(mode, name);
    if (asks && !mayOverwrite())
        return;
    SettingsEdit edit;
    PresetTree::write(edit, mode, name, contentOf(parent));
    saved = StoreWriting::commit(edit, name == batchPresetName() ? StoreWriting::Cause::Program
                                                                 : StoreWriting::Cause::User);
    isNew = saved && !asks;
}

void ensureFactoryPresets(QWidget*) {
    const QSettings kept = openSettings(); // so that the file is read once
    const QStringList names = FactoryPresets::names();
    if (std::all_of(names.begin(), names.end(),
                    [](const QString& name) { return presetExists(Mode_Advanced, name); }))
        return;
    SettingsEdit edit;
    for (const QString& name : names)
        PresetTree::write(edit, Mode_Advanced, name, FactoryPresets::contentOf(name));
    StoreWriting::commit(edit, StoreWriting::Cause::Program);
}

} // namespace CPresetStore
