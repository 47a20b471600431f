#include "Update/CheckVersion.h"

#include "Settings/SettingsStore.h"
#include "Update/UpdateServer.h"
#include "support/EnvironmentVariable.h"
#include "support/HttpServer.h"
#include "support/LogCapture.h"
#include "support/ModalDialog.h"

#include <QCheckBox>
#include <QDateTime>
#include <QDir>
#include <QElapsedTimer>
#include <QPushButton>
#include <QTest>
#include <QTextEdit>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

constexpr int kWeek = 604800;

/// What a check left behind.
struct Checked {
    QStringList messages;
    QVariant update;    ///< "UpdateAvailable"
    bool timed = false; ///< whether the time was written
};

/// A store without settings, and a server that is asked.
class CheckVersionTest : public testing::Test {
protected:
    CheckVersionTest() { openSettings().clear(); }

    /// The check, with the box "do not show again" clicked so many times in every message.
    Checked check(int clicks = 0) {
        Checked checked;
        const ModalDialogs user([&](QDialog& dialog) {
            checked.messages.append(dialog.findChild<QTextEdit*>()->toPlainText());
            for (int click = 0; click < clicks; ++click)
                QTest::mouseClick(dialog.findChild<QCheckBox*>(), Qt::LeftButton, Qt::NoModifier, {8, 8});
            mKeysInDialog = openSettings().allKeys();
            QTest::mouseClick(dialog.findChild<QPushButton*>(), Qt::LeftButton);
        });
        const qint64 before = QDateTime::currentSecsSinceEpoch();
        CheckVersion().checkVersion();
        checked.update = openSettings().value("UpdateAvailable");
        checked.timed = openSettings().value("LastUpdateCheckTime", -1).toLongLong() >= before;
        return checked;
    }

    Checked checkAnswer(const QByteArray& reply) {
        openSettings().clear();
        mServer.reply = HttpServer::ok(reply);
        return check();
    }

    HttpServer mServer;
    EnvironmentVariable mName{"ORVELA_UPDATE_SERVER", mServer.address()};
    EnvironmentVariable mProxy{"http_proxy", ""};
    QStringList mKeysInDialog;
};

const QString kMinor = QStringLiteral("An update to your version is available. You have version 2.00, latest "
                                      "available version is: %1.");
const QString kMajor = QStringLiteral("Newer version of Orvela is available. You have version 2.00, latest "
                                      "available version is: %1.");

} // namespace

TEST_F(CheckVersionTest, TellsOfNewerVersionsOnly) {
    const QByteArray zeros(2000, '0');
    const struct {
        QByteArray answer;
        QString message;
        QVariant update;
        bool timed;
    } cases[] = {
        {"2.5", kMinor.arg("2.5"), "2.5", true},
        // The settings keep what the server said, the message has room for a number.
        {"2.5" + zeros, kMinor.arg("2.500000000000000000"), QString("2.5" + zeros), true},
        {"2.01", kMinor.arg("2.01"), "2.01", true},
        {"3.1", kMajor.arg("3.1"), double(3.1F), true},
        {"10", kMajor.arg("10"), 10.0, true},
        {"2.0", {}, {}, true},
        {"1.9", {}, {}, false},
        {"no number", {}, {}, false},
        {"inf", {}, {}, false},
        {"nan", {}, {}, false},
    };
    for (const auto& [answer, message, update, timed] : cases) {
        const Checked checked = checkAnswer("Kestrand_Server_Said " + answer);
        EXPECT_EQ(checked.messages, message.isEmpty() ? QStringList() : QStringList(message))
            << answer.left(9).constData();
        EXPECT_EQ(checked.update, update) << answer.left(9).constData();
        EXPECT_EQ(checked.timed, timed) << answer.left(9).constData();
    }
    EXPECT_EQ(mServer.requests.size(), std::size(cases));
}

TEST_F(CheckVersionTest, IsSilentWhereTheAnswerIsNone) {
    const QByteArray marker = "Kestrand_Server_Said ";
    const std::pair<QByteArray, QByteArray> cases[] = {
        {"", "Malformed server answer."},
        {"2.5", "Malformed server answer."},
        {marker, "Malformed server answer."},
        {"<html><head><title>3.1 not found</title></head></html>", "Malformed server answer."},
        {marker + QByteArray(2048, '3'), "Malformed server answer."},
        {marker + QByteArray(1 << 20, '3'), "Malformed server answer."},
        {marker + "\1No such product", "No such product"},
        {marker + "\1", ""},
    };
    for (const auto& [reply, error] : cases) {
        const Checked checked = checkAnswer(reply);
        EXPECT_TRUE(checked.messages.isEmpty()) << reply.left(60).constData();
        EXPECT_EQ(openSettings().allKeys(), QStringList("LastUpdateCheckTime")) << reply.left(60).constData();
        EXPECT_TRUE(checked.timed) << reply.left(60).constData();
        std::array<char, 2048> buffer{};
        EXPECT_EQ(CheckVersion().postToServer("qmx/checkprodversion.php", "p=1&w=v", buffer), 0U);
        EXPECT_EQ(QByteArray(buffer.data()), error);
    }
}

TEST_F(CheckVersionTest, IsSilentWhereNothingComes) {
    HttpServer silent({}, HttpServer::WithNothing);
    const EnvironmentVariable name("ORVELA_UPDATE_SERVER", silent.address());
    QElapsedTimer time;
    time.start();
    const Checked checked = check();
    EXPECT_LT(time.elapsed(), 5000) << "the start is held up";
    EXPECT_TRUE(checked.messages.isEmpty() && !checked.update.isValid() && checked.timed);
    EXPECT_EQ(silent.requests.size(), 1);
}

TEST_F(CheckVersionTest, TakesAnAnswerThatFillsTheBufferAndEndsItAtAZero) {
    const QByteArray digits(2047, '7');
    mServer.reply = HttpServer::ok("Kestrand_Server_Said " + digits);
    std::array<char, 2048> buffer{};
    EXPECT_EQ(CheckVersion().postToServer("qmx/checkprodversion.php", "p=1&w=v", buffer), 2047U);
    EXPECT_EQ(QByteArray(buffer.data()), digits);
    ASSERT_EQ(mServer.requests.size(), 1);
    EXPECT_TRUE(mServer.requests[0].startsWith("POST /qmx/checkprodversion.php HTTP/1.1\r\n"));
    EXPECT_TRUE(mServer.requests[0].contains("\r\nUser-Agent: KestrandProduct\r\n"));
    std::array<char, 10> small{};
    EXPECT_EQ(CheckVersion().postToServer("qmx/checkprodversion.php", "p=1&w=v", small), 0U);
    EXPECT_EQ(QByteArray(small.data()), "Malformed");
    mServer.reply = HttpServer::ok(QByteArrayLiteral("Kestrand_Server_Said 2.7\0and more"));
    EXPECT_EQ(check().messages, QStringList(kMinor.arg("2.7")));
}

TEST_F(CheckVersionTest, AsksOnceAWeek) {
    mServer.reply = HttpServer::ok("Kestrand_Server_Said 2.0");
    const auto asksAfter = [this](qint64 seconds) {
        openSettings().setValue("LastUpdateCheckTime", int(QDateTime::currentSecsSinceEpoch() - seconds));
        const auto before = mServer.requests.size();
        check();
        return mServer.requests.size() > before;
    };
    EXPECT_FALSE(asksAfter(3 * 86400));
    EXPECT_FALSE(asksAfter(kWeek - 60));
    EXPECT_TRUE(asksAfter(kWeek));
    EXPECT_FALSE(asksAfter(-86400)); // the clock was set back
    EXPECT_TRUE(asksAfter(20 * 365 * 86400LL));
    openSettings().setValue("LastUpdateCheckTime", "long ago");
    EXPECT_TRUE(check().timed);
    LogCapture log;
    check();
    EXPECT_EQ(log.lines(), std::vector<std::string>{"Checking for an update."});
    openSettings().clear();
    check();
    EXPECT_TRUE(log.has("No time of a last update check was found."));
    EXPECT_TRUE(log.has("Checked for an update."));
}

TEST_F(CheckVersionTest, KeepsQuietOfAVersionOnceAskedTo) {
    mServer.reply = HttpServer::ok("Kestrand_Server_Said 2.5");
    const auto asked = [this](int clicks) {
        openSettings().remove("LastUpdateCheckTime");
        return check(clicks).messages;
    };
    EXPECT_EQ(asked(2).size(), 1); // ticked and cleared again
    EXPECT_EQ(openSettings().value("DoNotShowUpdateDialogFor2.50"), QVariant(false));
    EXPECT_EQ(asked(1).size(), 1);
    EXPECT_TRUE(mKeysInDialog.contains("DoNotShowUpdateDialogFor2.50")); // stored the moment it was ticked
    openSettings().remove("UpdateAvailable");
    EXPECT_TRUE(asked(0).isEmpty());
    QStringList keys = openSettings().allKeys();
    keys.sort();
    EXPECT_EQ(keys, QStringList({"DoNotShowUpdateDialogFor2.50", "LastUpdateCheckTime"}));
    mServer.reply = HttpServer::ok("Kestrand_Server_Said 2.6");
    EXPECT_EQ(asked(0), QStringList(kMinor.arg("2.6")));
}

TEST_F(CheckVersionTest, TellsAlsoWhereTheSettingsCannotBeWritten) {
    const QString path = openSettings().fileName();
    QFile::remove(path);
    ASSERT_TRUE(QDir().mkpath(path));
    mServer.reply = HttpServer::ok("Kestrand_Server_Said 3.0");
    const Checked checked = check(1);
    EXPECT_EQ(checked.messages, QStringList(kMajor.arg("3.0")));
    EXPECT_FALSE(checked.update.isValid() || checked.timed);
    ASSERT_TRUE(QDir().rmdir(path));
}

TEST_F(CheckVersionTest, GoesThroughTheProxyButNeverToAReservedName) {
    const EnvironmentVariable proxy("http_proxy", "http://" + mServer.address());
    for (const char* name : {"kestrand.example", "Kestrand.Example.:8080", "example", "two words", "a:b:c"}) {
        const EnvironmentVariable server("ORVELA_UPDATE_SERVER", name);
        EXPECT_FALSE(updateServer().exists()) << name;
        EXPECT_TRUE(check().timed) << name;
        openSettings().clear();
    }
    EXPECT_TRUE(mServer.requests.isEmpty());
    const EnvironmentVariable server("ORVELA_UPDATE_SERVER", "updates.test");
    const EnvironmentVariable sameProxy("http_proxy", mServer.address()); // a scheme goes without saying
    mServer.reply = HttpServer::ok("Kestrand_Server_Said 2.5");
    EXPECT_EQ(check().messages, QStringList(kMinor.arg("2.5")));
    ASSERT_EQ(mServer.requests.size(), 1);
    EXPECT_TRUE(mServer.requests[0].startsWith(
        "POST http://updates.test/qmx/checkprodversion.php HTTP/1.1\r\nHost: updates.test\r\n"));
    EXPECT_EQ(updateServer().port, 80);
}
