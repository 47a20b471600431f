#include "Update/UpdateServer.h"

#include <QUrl>

namespace orvela {

bool UpdateServer::exists() const {
    const QString name = host.endsWith(QLatin1Char('.')) ? host.chopped(1) : host;
    return !name.isEmpty() && name != QLatin1String("example") && !name.endsWith(QLatin1String(".example"));
}

UpdateServer updateServer() {
    QString name = qEnvironmentVariable("ORVELA_UPDATE_SERVER");
    if (name.isEmpty())
        name = QStringLiteral(ORVELA_UPDATE_SERVER);
    QUrl address;
    address.setAuthority(name); // in lower case; an empty one when it cannot be read
    return {address.host(), static_cast<quint16>(address.port(80))};
}

} // namespace orvela
