#include "command/PresetsCommand.h"

#include "Settings/FactoryPresets.h"
#include "Settings/PresetConversion.h"
#include "Settings/PresetFile.h"
#include "Utility/CGenericEx.h"
#include "command/Messages.h"
#include "files/Photograph.h"
#include "run/ModeNames.h"
#include "run/NearestNames.h"
#include "run/PresetFiles.h"
#include "run/UsageError.h"

#include <QFileInfo>

#include <CLI/CLI.hpp>
#include <iostream>

namespace orvela {

namespace {

ExitStatus report(ExitStatus status, const QString& text) {
    Messages::tell(text.toStdString());
    return status;
}

// The mode whose pane the presets belong to.
EGUIMode modeOf(const std::string& name) {
    const auto modes = ModeNames::withPresets();
    if (const ModeDescription* mode = ModeNames::find(name, modes))
        return mode->mode;
    std::vector<std::string> known;
    for (const ModeDescription* mode : modes)
        known.push_back(ModeNames::identifierOf(*mode));
    throw UsageError(
        "--mode: \"" + name + "\" has no presets of its own" +
        NearestNames::advice(name, known, "Advanced, FinalTouch and the modes with sliders have"));
}

QString nameOf(const PresetsOptions& options) {
    QString name = options.name.empty() ? QFileInfo(QString::fromStdString(options.file)).completeBaseName()
                                        : QString::fromStdString(options.name);
    if (name.isEmpty() || name == PresetTree::batchPresetName())
        throw UsageError("\"" + name.toStdString() + "\" cannot be the name of a preset");
    return name;
}

ExitStatus reportMissing(EGUIMode mode, const QString& name) {
    const std::string advice = NearestNames::advice(name.toStdString(), PresetFiles::names(mode),
                                                    "`orvela presets list` lists those stored");
    return report(ExitStatus::NothingMatched,
                  QStringLiteral("%1 has no preset \"%2\"%3")
                      .arg(getModeAsString(mode), name, QString::fromStdString(advice)));
}

ExitStatus commit(const SettingsEdit& edit) {
    try {
        edit.commit();
        return ExitStatus::Done;
    } catch (const CGenericEx& error) {
        return report(ExitStatus::TargetTrouble, error.message());
    }
}

// What is on and has no control in the mode's pane does not come with the stored preset.
QStringList withoutControl(EGUIMode mode, const CSliderParams& sliders) {
    const CSliderParams kept = PresetConversion::paramsOf(mode, PresetConversion::contentOf(mode, sliders));
    QStringList names;
    for (const SliderField& field : sliderFields())
        if (field.flag && sliders.*field.flag && !(kept.*field.flag))
            names.append(QString::fromLatin1(field.name));
    return names;
}

void reportLeftOut(const char* cause, const QStringList& names) {
    if (!names.isEmpty())
        report(ExitStatus::Done, QStringLiteral("left out, as %1: %2")
                                     .arg(QLatin1String(cause), names.join(QStringLiteral(", "))));
}

} // namespace

void PresetsOptions::declare(CLI::App& app, const std::function<void(std::function<ExitStatus()>)>& chosen) {
    app.require_subcommand(1);
    const auto add = [&](const char* name, const char* help, ExitStatus (*perform)(const PresetsOptions&)) {
        CLI::App* command = app.add_subcommand(name, help);
        command->add_option("--mode", mode, "the mode that the presets belong to")->capture_default_str();
        command->callback([this, chosen, perform] { chosen([this, perform] { return perform(*this); }); });
        return command;
    };
    const char* const force = "overwrite what is there under that name";
    add("list", "List the presets by name", listPresets);
    CLI::App* exporting = add("export", "Write a preset to a file", exportPreset);
    exporting->add_option("NAME", name, "the preset")->required();
    exporting->add_option("FILE", file, "the JSON file")->required();
    exporting->add_flag("--force", overwrite, force);
    CLI::App* importing = add("import", "Store a file as a preset", importPreset);
    importing->add_option("FILE", file, "the JSON file")->required();
    importing->add_option("NAME", name, "the preset (default: the name of the file)");
    importing->add_flag("--force", overwrite, force);
    add("remove", "Remove a preset", removePreset)->add_option("NAME", name, "the preset")->required();
}

ExitStatus listPresets(const PresetsOptions& options) {
    for (const QString& name : PresetTree::offeredNames(modeOf(options.mode)))
        std::cout << Messages::shown(name.toStdString()) << '\n';
    return ExitStatus::Done;
}

ExitStatus exportPreset(const PresetsOptions& options) {
    const EGUIMode mode = modeOf(options.mode);
    const QString name = nameOf(options);
    const std::optional<CSliderParams> stored = PresetFiles::stored(mode, name);
    if (!stored)
        return reportMissing(mode, name);
    try {
        PresetFile preset = PresetFiles::toWriteInto(options.file, options.overwrite);
        preset.take(*stored);
        PresetFiles::write(preset, options.file, options.overwrite);
    } catch (const std::runtime_error& error) { // of a preset or of a target
        return report(ExitStatus::TargetTrouble, QString::fromStdString(error.what()));
    }
    return ExitStatus::Done;
}

ExitStatus importPreset(const PresetsOptions& options) {
    const EGUIMode mode = modeOf(options.mode);
    const QString name = nameOf(options);
    const PresetFile preset = PresetFiles::read(options.file);
    const bool exists = PresetTree::names(mode).contains(name) || FactoryPresets::isFactoryPreset(mode, name);
    if (exists && !options.overwrite)
        return report(
            ExitStatus::TargetTrouble,
            QStringLiteral("%1 has a preset \"%2\"; --force overwrites it").arg(getModeAsString(mode), name));
    CSliderParams sliders;
    preset.applyTo(sliders);
    reportLeftOut("this version does not know them", preset.unknownNames());
    reportLeftOut("the presets of this mode do not hold them", withoutControl(mode, sliders));
    SettingsEdit edit;
    PresetTree::remove(edit, mode, name);
    PresetTree::write(edit, mode, name, PresetConversion::contentOf(mode, sliders));
    return commit(edit);
}

ExitStatus removePreset(const PresetsOptions& options) {
    const EGUIMode mode = modeOf(options.mode);
    const QString name = nameOf(options);
    if (FactoryPresets::isFactoryPreset(mode, name))
        throw UsageError("\"" + name.toStdString() + "\" comes with the program and cannot be removed");
    if (!PresetTree::names(mode).contains(name))
        return reportMissing(mode, name);
    SettingsEdit edit;
    PresetTree::remove(edit, mode, name);
    return commit(edit);
}

} // namespace orvela
