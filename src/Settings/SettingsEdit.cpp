#include "Settings/SettingsEdit.h"

#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryFile>

#include <algorithm>

namespace orvela {

namespace {

using Changes = std::vector<SettingsEdit::Change>;

[[noreturn]] void fail(const char* text, const QString& store, int line) {
    throw SettingsError(ErrorText("SettingsEdit", text, {store}), line);
}

constexpr char kUnwritten[] = QT_TRANSLATE_NOOP("SettingsEdit", "The settings could not be written to %1.");

// Whether the store's parser would keep every line. It drops what it does not understand.
bool isSettingsText(const QByteArray& text) {
    if (text.contains('\0'))
        return false;
    bool continued = false;
    for (qsizetype start = 0; start < text.size();) {
        const qsizetype end = text.indexOf('\n', start);
        const qsizetype length = (end < 0 ? text.size() : end) - start;
        const QByteArray line = QByteArray::fromRawData(text.constData() + start, length).trimmed();
        const bool isSection = line.startsWith('[') && line.endsWith(']');
        if (!continued && !line.isEmpty() && !isSection && line.indexOf('=') < 1)
            return false;
        continued = line.endsWith('\\');
        start += length + 1;
    }
    return true;
}

void keepForeignFile(const QString& path) {
    QFile file(path);
    if (!QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly) || isSettingsText(file.readAll()))
        return;
    const QString first = path + QStringLiteral(".kept");
    QString copy = first;
    for (int number = 2; QFileInfo::exists(copy); ++number)
        copy = first + QString::number(number);
    if (!QFile::copy(path, copy))
        fail(QT_TRANSLATE_NOOP("SettingsEdit",
                               "The settings file %1 holds something else, and no copy of it could be made."),
             path, __LINE__);
    Log::log(LogLevel::Warning, "The settings file held something else; it is kept as %s.",
             copy.toUtf8().constData());
}

// At least the bytes that the changes add to the file, every character escaped.
qint64 sizeOf(const Changes& changes) {
    qint64 size = 0;
    for (const auto& [key, value] : changes)
        size += 4 * (key.toUtf8().size() + value.value_or(QVariant()).toByteArray().size()) + 64;
    return size;
}

// The store takes a short write for a whole one and would put a cut file in the place of the old one: make
// sure beforehand that there is room for both.
void checkRoom(const QString& path, const Changes& changes) {
    if (path.startsWith(QLatin1String("\\HKEY_")))
        return; // a registry
    constexpr qint64 kLockFile = 4096;
    const QFileInfo file(path);
    const QByteArray bytes(file.size() + sizeOf(changes) + kLockFile, '\0');
    QTemporaryFile probe(file.path() + QStringLiteral("/.room-XXXXXX"));
    if (!QDir().mkpath(file.path()) || !probe.open() || probe.write(bytes) != bytes.size() ||
        !probe.flush() || QFileInfo(probe.fileName()).size() != bytes.size())
        fail(kUnwritten, path, __LINE__);
}

// Every key at and below `key`.
QStringList keysBelow(QSettings& settings, const QString& key) {
    settings.beginGroup(key);
    QStringList keys = settings.allKeys();
    settings.endGroup();
    for (QString& each : keys)
        each.prepend(key + QLatin1Char('/'));
    if (settings.contains(key))
        keys.append(key);
    return keys;
}

// What undoes the changes.
Changes valuesBefore(QSettings& settings, const Changes& changes) {
    Changes before;
    for (const auto& [key, value] : changes) {
        const QStringList keys = value ? QStringList(key) : keysBelow(settings, key);
        for (const QString& each : keys)
            before.push_back(
                {each, settings.contains(each) ? std::optional(settings.value(each)) : std::nullopt});
    }
    return before;
}

void apply(QSettings& settings, const Changes& changes) {
    for (const auto& [key, value] : changes)
        value ? settings.setValue(key, *value) : settings.remove(key);
}

} // namespace

void SettingsEdit::commit() const {
    // Asking at the root has the whole file understood, and every complaint about it made to this object, so
    // that the status of the other tells of the writing alone.
    QSettings reader = openSettings();
    reader.childKeys();
    keepForeignFile(reader.fileName());
    checkRoom(reader.fileName(), mChanges);
    const Changes before = valuesBefore(reader, mChanges);
    QSettings writer = openSettings();
    apply(writer, mChanges);
    writer.sync();
    if (writer.status() == QSettings::NoError)
        return;
    // The process remembers unwritten values and would show them, and write them at the next occasion.
    apply(writer, before);
    fail(kUnwritten, reader.fileName(), __LINE__);
}

} // namespace orvela
