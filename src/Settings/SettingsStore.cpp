#include "Settings/SettingsStore.h"

#include <QStandardPaths>

namespace orvela {

namespace {

const QString kOrganization = QStringLiteral("Kestrand");

QString& application() {
    static QString name = QStringLiteral("Orvela");
    return name;
}

} // namespace

QSettings openSettings() {
#ifdef Q_OS_WIN
    return QSettings(kOrganization, application());
#else
    // By its file: the store alone, not what the system and the organisation have beside it.
    return QSettings(settingsPath(), QSettings::NativeFormat);
#endif
}

QString settingsPath() {
    return QStringLiteral("%1/%2/%3.conf")
        .arg(QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation), kOrganization,
             application());
}

void setSettingsApplication(const QString& name) {
    application() = name;
}

} // namespace orvela
