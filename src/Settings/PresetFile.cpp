#include "Settings/PresetFile.h"

#include "Settings/SettingFields.h"

#include <QCoreApplication>
#include <QJsonDocument>

namespace orvela {

namespace {

constexpr int kVersion = 1;
const QString kVersionKey = QStringLiteral("version");
const QString kSettingsKey = QStringLiteral("settings");

[[noreturn]] void fail(const char* text, const QStringList& values) {
    throw PresetError(ErrorText("PresetFile", text, values));
}

const SliderField* fieldNamed(const QString& name) {
    return SettingFields::find(name.toStdString());
}

void checkValue(const QString& path, const QString& name, const QJsonValue& value) {
    const SliderField* field = fieldNamed(name);
    if (!field)
        return;
    if (field->flag) {
        if (!value.isBool())
            fail(QT_TRANSLATE_NOOP("PresetFile", "%1: %2 must be true or false"), {path, name});
        return;
    }
    const float high = SettingFields::highest(*field);
    if (!value.isDouble() || value.toDouble() < 0 || value.toDouble() > high)
        fail(QT_TRANSLATE_NOOP("PresetFile", "%1: %2 must be a number from 0 to %3"),
             {path, name, QString::number(high)});
}

QJsonObject rootOf(const QByteArray& text, const QString& path) {
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(text, &error);
    if (document.isNull())
        fail(QT_TRANSLATE_NOOP("PresetFile",
                               "%1: is not JSON (%2 at byte %3); name a file that --save-preset wrote"),
             {path, error.errorString(), QString::number(error.offset)});
    QJsonObject root = document.object();
    if (!root.value(kVersionKey).isDouble() || !root.value(kSettingsKey).isObject())
        fail(QT_TRANSLATE_NOOP("PresetFile",
                               "%1: is not a preset (a number \"version\" and an object "
                               "\"settings\" are needed); name a file that --save-preset wrote"),
             {path});
    if (root.value(kVersionKey).toDouble() != kVersion)
        fail(QT_TRANSLATE_NOOP(
                 "PresetFile",
                 "%1: has version %2, this program reads version %3; use the program that wrote it"),
             {path, root.value(kVersionKey).toVariant().toString(), QString::number(kVersion)});
    return root;
}

} // namespace

PresetFile::PresetFile() : mRoot{{kVersionKey, kVersion}, {kSettingsKey, QJsonObject()}} {}

PresetFile PresetFile::parse(const QByteArray& text, const QString& path) {
    PresetFile preset;
    preset.mRoot = rootOf(text, path);
    const QJsonObject settings = preset.mRoot.value(kSettingsKey).toObject();
    for (auto entry = settings.begin(); entry != settings.end(); ++entry)
        checkValue(path, entry.key(), entry.value());
    return preset;
}

void PresetFile::applyTo(CSliderParams& sliders) const {
    const QJsonObject settings = mRoot.value(kSettingsKey).toObject();
    for (auto entry = settings.begin(); entry != settings.end(); ++entry) {
        const SliderField* field = fieldNamed(entry.key());
        if (field && field->flag)
            sliders.*field->flag = entry.value().toBool();
        else if (field)
            sliders.*field->value = static_cast<float>(entry.value().toDouble());
    }
}

void PresetFile::take(const CSliderParams& sliders) {
    QJsonObject settings = mRoot.value(kSettingsKey).toObject();
    for (const SliderField& field : sliderFields()) {
        const QString name = QString::fromLatin1(field.name);
        if (field.flag)
            settings.insert(name, sliders.*field.flag);
        else
            settings.insert(name, static_cast<double>(sliders.*field.value));
    }
    mRoot.insert(kSettingsKey, settings);
}

QByteArray PresetFile::text() const {
    return QJsonDocument(mRoot).toJson();
}

QStringList PresetFile::unknownNames() const {
    QStringList unknown;
    for (const QString& name : mRoot.keys())
        if (name != kVersionKey && name != kSettingsKey)
            unknown << name;
    for (const QString& name : mRoot.value(kSettingsKey).toObject().keys())
        if (!fieldNamed(name))
            unknown << name;
    return unknown;
}

} // namespace orvela
