#include "Update/CheckVersion.h"

#include "Platform/WebPost.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Update/RunningVersion.h"
#include "Update/UpdateMessage.h"
#include "Update/UpdateServer.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QCheckBox>
#include <QDateTime>

#include <algorithm>
#include <array>
#include <cmath>

using namespace orvela;

namespace {

constexpr qint64 kCheckInterval = 604800; // seconds
constexpr QByteArrayView kReplyMarker = "Kestrand_Server_Said ";
constexpr char kErrorByte = 1;
constexpr qsizetype kMostShown = 20; // characters of what should be a number
const QString kLastCheck = QStringLiteral("/LastUpdateCheckTime");

qint64 now() {
    return QDateTime::currentSecsSinceEpoch();
}

void write(const QString& key, const QVariant& value) {
    SettingsEdit edit;
    edit.set(key, value);
    try {
        edit.commit();
    } catch (const CGenericEx&) {
        // Whoever works with the settings next tells the user that they cannot be written.
    }
}

bool isDue() {
    const QSettings settings = openSettings();
    if (!settings.contains(kLastCheck)) {
        Log::log(LogLevel::Debug, "No time of a last update check was found.");
        return true;
    }
    return settings.value(kLastCheck, -1).toInt() + kCheckInterval <= now();
}

float numberOf(const QString& text) {
    const float number = text.toFloat();
    return std::isfinite(number) ? number : 0; // "inf" and "nan" are no version numbers
}

// Puts the text and a terminating zero into the buffer, cut where it ends.
void copy(QByteArrayView text, std::span<char> buffer) {
    if (buffer.empty())
        return;
    const auto length = std::min<std::size_t>(static_cast<std::size_t>(text.size()), buffer.size() - 1);
    std::copy_n(text.data(), length, buffer.begin());
    buffer[length] = 0;
}

} // namespace

void CheckVersion::checkVersion() {
    Log::log(LogLevel::Debug, "Checking for an update.");
    if (!isDue() || askServer() == Outcome::ServerIsOlder)
        return;
    write(kLastCheck, static_cast<qint32>(now()));
    Log::log(LogLevel::Debug, "Checked for an update.");
}

CheckVersion::Outcome CheckVersion::askServer() {
    std::array<char, 2048> reply{};
    if (postToServer("qmx/checkprodversion.php", "p=1&w=v", reply) == 0)
        return Outcome::Checked;
    mLatestVersionText = QString::fromUtf8(reply.data());
    mLatestVersion = numberOf(mLatestVersionText);
    mDoNotShowKey = QStringLiteral("DoNotShowUpdateDialogFor%1").arg(double(mLatestVersion), 0, 'f', 2);
    mUpdateKey = QStringLiteral("UpdateAvailable");
    return PresetTree::switchOf(openSettings().value(mDoNotShowKey)) ? Outcome::Checked : compare();
}

CheckVersion::Outcome CheckVersion::compare() {
    const double latest = mLatestVersion;
    const QString running = QString::number(kRunningVersion, 'f', 2);
    const QString shown = mLatestVersionText.left(kMostShown);
    if (std::floor(latest) > std::floor(kRunningVersion)) {
        showUpdateMessage(tr("Newer version of Orvela is available. You have version %1, latest available "
                             "version is: %2.")
                              .arg(running, shown));
        write(mUpdateKey, latest);
    } else if (std::floor(latest) < std::floor(kRunningVersion)) {
        return Outcome::ServerIsOlder;
    } else if (latest > kRunningVersion) {
        showUpdateMessage(tr("An update to your version is available. You have version %1, latest available "
                             "version is: %2.")
                              .arg(running, shown));
        write(mUpdateKey, mLatestVersionText);
    }
    return Outcome::Checked;
}

void CheckVersion::showUpdateMessage(const QString& text) {
    UpdateMessage message(text);
    connect(message.doNotShow(), &QCheckBox::clicked, this, &CheckVersion::onDoNotShowNewVersion);
    message.exec();
}

unsigned CheckVersion::postToServer(const QByteArray& path, const QByteArray& body, std::span<char> reply) {
    const auto fail = [reply](const QString& text) {
        copy(text.toUtf8(), reply);
        return 0U;
    };
    const UpdateServer server = updateServer();
    if (!server.exists())
        return fail(QStringLiteral("Unable to etablish contact with server."));
    const auto [sent, error] = WebPost::post(
        {server.host.toStdString(), server.port, path.toStdString(), body.toStdString(), "KestrandProduct"});
    if (!error.empty())
        return fail(QString::fromStdString(error));
    const QByteArray received = QByteArray::fromStdString(sent);
    const QString malformed = QStringLiteral("Malformed server answer.");
    if (received.size() <= kReplyMarker.size() || !received.contains(kReplyMarker))
        return fail(malformed);
    const QByteArray answer = received.mid(kReplyMarker.size());
    if (answer.front() == kErrorByte)
        return fail(QString::fromUtf8(answer.mid(1)));
    if (static_cast<std::size_t>(answer.size()) >= reply.size())
        return fail(malformed);
    copy(answer, reply);
    return static_cast<unsigned>(answer.size());
}

void CheckVersion::onDoNotShowNewVersion(bool cbState) {
    write(mDoNotShowKey, cbState);
}
