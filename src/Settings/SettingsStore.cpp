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
    return QSettings(kOrganization, application());
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
