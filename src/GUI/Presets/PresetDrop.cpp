#include "GUI/Presets/PresetDrop.h"

#include "GUI/Presets/CPresetStore.h"
#include "Settings/PresetConversion.h"
#include "Settings/PresetFile.h"
#include "Settings/SettingFields.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QUrl>

namespace orvela {

namespace PresetDrop {

namespace {

constexpr qint64 kMostBytes = 4'000'000;

[[noreturn]] void fail(const char* text, const QStringList& values) {
    throw PresetError(ErrorText("PresetDrop", text, values));
}

QByteArray contentOf(const QString& path) {
    if (!QFileInfo(path).isFile())
        fail(QT_TRANSLATE_NOOP(
                 "PresetDrop",
                 "%1: is not a file; drop one preset file, such as one that --save-preset wrote"),
             {path});
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        fail(QT_TRANSLATE_NOOP("PresetDrop", "%1: cannot be read: %2"), {path, file.errorString()});
    if (file.size() > kMostBytes)
        fail(QT_TRANSLATE_NOOP("PresetDrop", "%1: is larger than 4 MB; drop a file that --save-preset wrote"),
             {path});
    return file.readAll();
}

QStringList switchedOn(const CSliderParams& sliders) {
    QStringList labels;
    for (const SliderDescription& slider : SliderTable::sliders())
        if (sliders.*slider.enabled)
            labels += QCoreApplication::translate("SliderTable", slider.label);
    return labels;
}

} // namespace

QString fileOf(const QList<QUrl>& dropped) {
    if (dropped.size() != 1 || !dropped.first().isLocalFile())
        fail(QT_TRANSLATE_NOOP(
                 "PresetDrop",
                 "Only one preset file at a time can be dropped here, such as one that --save-preset wrote."),
             {});
    return dropped.first().toLocalFile();
}

QStringList load(QWidget* parent, EGUIMode mode, CSliderParams now, const QString& path) {
    const PresetFile file = PresetFile::parse(contentOf(path), path);
    for (const SliderField& field : sliderFields())
        if (field.flag)
            now.*field.flag = false;
    file.applyTo(now);
    const PresetContent content = PresetConversion::contentOf(mode, now);
    const QStringList wanted = switchedOn(now);
    const QStringList kept = switchedOn(PresetConversion::paramsOf(mode, content));
    QStringList left = wanted;
    left.removeIf([&kept](const QString& label) { return kept.contains(label); });
    if (!left.isEmpty() && kept.isEmpty())
        fail(QT_TRANSLATE_NOOP(
                 "PresetDrop",
                 "%1: holds nothing that these sliders can show (%2); drop it on the window of Advanced"),
             {path, left.join(QStringLiteral(", "))});
    CPresetStore::show(parent, content);
    return left;
}

} // namespace PresetDrop

} // namespace orvela
