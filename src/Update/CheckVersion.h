#pragma once

#include <QObject>
#include <QString>

#include <span>

/// Asks the maker's web server once a week for the latest version, tells the user of a newer one, and notes
/// in the settings store (key "UpdateAvailable") that there is one. Every failure is silent.
class CheckVersion : public QObject {
    Q_OBJECT

public:
    CheckVersion() = default;

    /// Checks, unless the last check was less than seven days ago. Returns after some seconds at most, plus
    /// the time the user takes to read.
    void checkVersion();

    /// Posts `body` to `path` on the server.
    /// @param reply  receives the answer and a terminating zero, or the text of the failure, cut where it
    /// ends
    /// @return the answer's length in bytes, 0 on any failure: an answer too long for `reply` is one
    unsigned postToServer(const QByteArray& path, const QByteArray& body, std::span<char> reply);

public Q_SLOTS:
    /// Stores the choice about the latest version.
    void onDoNotShowNewVersion(bool cbState);

private:
    enum class Outcome { Checked, ServerIsOlder };

    Outcome askServer();
    Outcome compare();
    void showUpdateMessage(const QString& text);

    float mLatestVersion = 0;
    QString mLatestVersionText;
    QString mDoNotShowKey;
    QString mUpdateKey;
};
