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

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(PresetDrop)
};

[[noreturn]] void fail(const QString& message) {
    throw PresetError(message.toStdString());
}

QByteArray contentOf(const QString& path) {
    if (!QFileInfo(path).isFile())
        fail(Texts::tr("%1: is not a file; drop one preset file, such as one that --save-preset wrote")
                 .arg(path));
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        fail(Texts::tr("%1: cannot be read: %2").arg(path, file.errorString()));
    if (file.size() > kMostBytes)
        fail(Texts::tr("%1: is larger than 4 MB; drop a file that --save-preset wrote").arg(path));
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
        fail(Texts::tr(
            "Only one preset file at a time can be dropped here, such as one that --save-preset wrote."));
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
        fail(
            Texts::tr("%1: holds nothing that these sliders can show (%2); drop it on the window of Advanced")
                .arg(path, left.join(QStringLiteral(", "))));
    CPresetStore::show(parent, content);
    return left;
}

} // namespace PresetDrop

} // namespace orvela
