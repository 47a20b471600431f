#include "Settings/PresetFile.h"

#include "Settings/SettingFields.h"

#include <QJsonDocument>

namespace orvela {

namespace {

constexpr int kVersion = 1;
const QString kVersionKey = QStringLiteral("version");
const QString kSettingsKey = QStringLiteral("settings");

[[noreturn]] void fail(const QString& path, const QString& cause) {
    throw PresetError((path + QStringLiteral(": ") + cause).toStdString());
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
            fail(path, QStringLiteral("%1 must be true or false").arg(name));
        return;
    }
    const float high = SettingFields::highest(*field);
    if (!value.isDouble() || value.toDouble() < 0 || value.toDouble() > high)
        fail(path, QStringLiteral("%1 must be a number from 0 to %2").arg(name).arg(high));
}

QJsonObject rootOf(const QByteArray& text, const QString& path) {
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(text, &error);
    if (document.isNull())
        fail(path, QStringLiteral("is not JSON (%1 at byte %2); name a file that --save-preset wrote")
                       .arg(error.errorString())
                       .arg(error.offset));
    QJsonObject root = document.object();
    if (!root.value(kVersionKey).isDouble() || !root.value(kSettingsKey).isObject())
        fail(path, QStringLiteral("is not a preset (a number \"version\" and an object \"settings\" are "
                                  "needed); name a file that --save-preset wrote"));
    if (root.value(kVersionKey).toDouble() != kVersion)
        fail(path,
             QStringLiteral("has version %1, this program reads version %2; use the program that wrote it")
                 .arg(root.value(kVersionKey).toVariant().toString())
                 .arg(kVersion));
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
