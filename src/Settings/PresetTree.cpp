#include "Settings/PresetTree.h"

#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"

#include <QRegularExpression>

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

const QString kPresets = QStringLiteral("2000/UserPresets/");
const QString kSliders = QStringLiteral("Sliders");
const QString kColorPickers = QStringLiteral("ColorPickers");
const QString kCheckBoxes = QStringLiteral("CheckBoxes");

// The name as one part of a key.
QString partOf(QString name) {
    static const QRegularExpression escaped(QStringLiteral("%(?=(25)*(2F|5C))"));
    return name.replace(escaped, QStringLiteral("%25"))
        .replace(QLatin1Char('/'), QStringLiteral("%2F"))
        .replace(QLatin1Char('\\'), QStringLiteral("%5C"));
}

QString nameOf(QString part) {
    static const QRegularExpression escaped(QStringLiteral("%25(?=(25)*(2F|5C))"));
    static const QRegularExpression slash(QStringLiteral("%2F"));
    const QChar mark(0xFFFF); // stands for the percent sign of an escape while slashes are put back
    return part.replace(escaped, mark)
        .replace(slash, QStringLiteral("/"))
        .replace(QStringLiteral("%5C"), QStringLiteral("\\"))
        .replace(mark, QStringLiteral("%"));
}

QString groupOf(EGUIMode mode) {
    const QString name = getModeAsString(mode);
    return name.isEmpty() ? QString() : kPresets + name;
}

QString groupOf(EGUIMode mode, const QString& preset) {
    const QString group = groupOf(mode);
    if (group.isEmpty() || preset.isEmpty())
        throw CGenericEx(QStringLiteral("A preset needs a mode and a name."), "PresetTree.cpp", __LINE__);
    return group + QLatin1Char('/') + partOf(preset);
}

double numberOf(const QVariant& value) {
    const double number = value.toDouble();
    return std::isfinite(number) ? number : 0;
}

double positionOf(const QVariant& value) {
    return std::clamp(numberOf(value), 0.0, 1000.0);
}

int channelOf(const QVariant& value) {
    return static_cast<int>(std::clamp(numberOf(value), 0.0, 255.0));
}

// Reads every child group of `group` below the current one with `readEntry`.
template <typename Entry, typename ReadEntry>
QList<Entry> entriesOf(QSettings& settings, const QString& group, ReadEntry readEntry) {
    QList<Entry> entries;
    settings.beginGroup(group);
    for (const QString& part : settings.childGroups()) {
        settings.beginGroup(part);
        entries.append(readEntry(nameOf(part)));
        settings.endGroup();
    }
    settings.endGroup();
    return entries;
}

PresetContent contentOf(QSettings& settings) {
    const auto value = [&settings](const char* key) { return settings.value(QLatin1String(key)); };
    PresetContent content;
    content.sliders = entriesOf<PresetSlider>(settings, kSliders, [&](const QString& object) {
        return PresetSlider{object, positionOf(value("Value")), PresetTree::switchOf(value("Enabled"))};
    });
    content.colors = entriesOf<PresetColor>(settings, kColorPickers, [&](const QString& object) {
        return PresetColor{object, channelOf(value("Red")), channelOf(value("Green")),
                           channelOf(value("Blue"))};
    });
    content.checkBoxes = entriesOf<PresetCheckBox>(settings, kCheckBoxes, [&](const QString& object) {
        return PresetCheckBox{object, PresetTree::switchOf(value("Checked"))};
    });
    return content;
}

} // namespace

namespace PresetTree {

QString guiKey(const QString& name) {
    return QStringLiteral("2000/GUI/") + name;
}

QString batchModeKey() {
    return guiKey(QStringLiteral("batchMode"));
}

QString batchPresetName() {
    return QStringLiteral("__batchmodesettings__");
}

// Stricter than the conversion of the variant, which takes any text for true.
bool switchOf(const QVariant& value) {
    if (value.typeId() == QMetaType::Bool)
        return value.toBool();
    const QString text = value.toString();
    return text.compare(QLatin1String("true"), Qt::CaseInsensitive) == 0 || text == QLatin1String("1");
}

QStringList names(EGUIMode mode) {
    const QString group = groupOf(mode);
    if (group.isEmpty())
        return {};
    QSettings settings = openSettings();
    settings.beginGroup(group);
    QStringList names = settings.childGroups();
    std::transform(names.begin(), names.end(), names.begin(), nameOf);
    return names;
}

QStringList offeredNames(EGUIMode mode) {
    QStringList offered = names(mode);
    offered.removeAll(batchPresetName());
    return offered;
}

bool exists(EGUIMode mode, const QString& name) {
    if (groupOf(mode).isEmpty() || name.isEmpty())
        return false;
    QSettings settings = openSettings();
    settings.beginGroup(groupOf(mode, name));
    return !settings.childGroups().isEmpty() || !settings.childKeys().isEmpty();
}

bool hasPresets() {
    QSettings settings = openSettings();
    settings.beginGroup(kPresets);
    return !settings.childGroups().isEmpty();
}

std::optional<PresetContent> read(EGUIMode mode, const QString& name) {
    QSettings settings = openSettings(); // kept open, so that the file is read once
    if (!exists(mode, name))
        return std::nullopt;
    settings.beginGroup(groupOf(mode, name));
    return contentOf(settings);
}

void write(SettingsEdit& edit, EGUIMode mode, const QString& name, const PresetContent& content) {
    const QString preset = groupOf(mode, name) + QLatin1Char('/');
    const auto set = [&](const QString& group, const QString& object, const char* key,
                         const QVariant& value) {
        edit.set(preset + group + QLatin1Char('/') + partOf(object) + QLatin1String(key), value);
    };
    for (const PresetSlider& slider : content.sliders) {
        set(kSliders, slider.object, "/Value", slider.value);
        set(kSliders, slider.object, "/Enabled", slider.enabled);
    }
    for (const PresetColor& color : content.colors) {
        set(kColorPickers, color.object, "/Red", color.red);
        set(kColorPickers, color.object, "/Green", color.green);
        set(kColorPickers, color.object, "/Blue", color.blue);
    }
    for (const PresetCheckBox& box : content.checkBoxes)
        set(kCheckBoxes, box.object, "/Checked", box.checked);
}

void remove(SettingsEdit& edit, EGUIMode mode, const QString& name) {
    edit.remove(groupOf(mode, name));
}

} // namespace PresetTree

} // namespace orvela
