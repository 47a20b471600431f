#include "run/PresetFiles.h"

#include "Settings/FactoryPresets.h"
#include "Settings/PaneTable.h"
#include "Settings/PresetConversion.h"
#include "Settings/SettingsStore.h"
#include "files/SourceFile.h"
#include "files/TargetFile.h"

namespace orvela {

namespace PresetFiles {

namespace {

namespace fs = std::filesystem;

constexpr std::uintmax_t kMostBytes = 4'000'000;
constexpr std::uintmax_t kMostStoreBytes = 100'000'000; // some 25 000 presets

CSliderParams settingsOf(EGUIMode mode, const PresetContent& content) {
    CSliderParams settings = PresetConversion::paramsOf(mode, content);
    if (mode != Mode_FinalTouch) // no preset of another pane holds it
        PaneTable::startFinalTouch(settings);
    return settings;
}

} // namespace

PresetFile read(const std::string& path) {
    Bytes bytes;
    try {
        const SourceFile file(path);
        if (file.size() > kMostBytes)
            throw PresetError(path + ": is larger than 4 MB; name a file that --save-preset wrote");
        bytes = file.read(0, file.size());
    } catch (const PhotographError& error) {
        throw PresetError(error.what());
    }
    const QByteArray text(reinterpret_cast<const char*>(bytes.data()), static_cast<qsizetype>(bytes.size()));
    return PresetFile::parse(text, QString::fromStdString(path));
}

PresetFile toWriteInto(const std::string& path, bool overwrite) {
    if (isStream(path))
        return {};
    checkTargetPath(path, {}, overwrite);
    return fs::exists(path) ? read(path) : PresetFile();
}

void write(const PresetFile& preset, const std::string& path, bool overwrite) {
    TargetFile file(linkedFile(path), path);
    file.write(preset.text().toStdString());
    file.commit(overwrite);
}

void checkStore() {
    const fs::path store = settingsPath().toStdString();
    std::error_code none;
    const bool isLarge = fs::is_regular_file(store, none) && fs::file_size(store, none) > kMostStoreBytes;
    if (isLarge || fs::is_other(store, none))
        throw PresetError(store.string() + ": is not a settings file of at most 100 MB; move it away");
}

std::optional<CSliderParams> stored(EGUIMode mode, const QString& name) {
    std::optional<PresetContent> content;
    if (name != PresetTree::batchPresetName())
        content = PresetTree::read(mode, name);
    if (!content && FactoryPresets::isFactoryPreset(mode, name))
        content = FactoryPresets::contentOf(name);
    return content ? std::optional(settingsOf(mode, *content)) : std::nullopt;
}

std::optional<CSliderParams> lastAccepted(EGUIMode mode) {
    if (!PresetConversion::hasControls(mode))
        return std::nullopt;
    const std::optional<PresetContent> content = PresetTree::read(mode, PresetTree::batchPresetName());
    return content ? std::optional(settingsOf(mode, *content)) : std::nullopt;
}

std::vector<std::string> names(EGUIMode mode) {
    QStringList all = PresetTree::offeredNames(mode);
    for (const QString& name : FactoryPresets::names())
        if (FactoryPresets::isFactoryPreset(mode, name) && !all.contains(name))
            all.append(name);
    std::vector<std::string> texts;
    for (const QString& name : all)
        texts.push_back(name.toStdString());
    return texts;
}

} // namespace PresetFiles

} // namespace orvela
