#include "Settings/SettingsStore.h"

namespace orvela {

namespace {

QString& application() {
    static QString name = QStringLiteral("Orvela");
    return name;
}

} // namespace

QSettings openSettings() {
    return QSettings(QStringLiteral("Kestrand"), application());
}

void setSettingsApplication(const QString& name) {
    application() = name;
}

} // namespace orvela
