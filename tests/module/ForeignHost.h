#pragma once

#include "hosts/command/ProgramRun.h"

#include <QRegularExpression>

#include <initializer_list>
#include <ostream>

/// How a failed comparison shows the lines of a host or a log.
inline void PrintTo(const QString& line, std::ostream* out) {
    *out << '"' << line.toStdString() << '"';
}

namespace orvela {

/// The module in a host in plain C: a test writes the host's commands and reads what it prints.
class ForeignHostTest : public ProgramTest {
protected:
    ForeignHostTest() {
        mEnvironment = QProcessEnvironment::systemEnvironment();
        for (const char* gone : {"DISPLAY", "WAYLAND_DISPLAY", "ORVELA_TMP_FILE", "ORVELA_DEBUG_MBOX"})
            mEnvironment.remove(QLatin1String(gone));
        for (const char* folder : {"XDG_CONFIG_HOME", "XDG_CACHE_HOME", "XDG_RUNTIME_DIR", "HOME", "TMP"})
            mEnvironment.insert(QLatin1String(folder), mFolder.path());
        mEnvironment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
        mEnvironment.insert(QStringLiteral("LC_ALL"), QStringLiteral("C.UTF-8"));
        // The leak sanitizer misjudges where the thread-local variables of a loaded module lie, and goes
        // wrong there.
        mEnvironment.insert(QStringLiteral("ASAN_OPTIONS"), QStringLiteral("intercept_tls_get_addr=0"));
    }

    /// What the host prints for the commands, one a line, between the loading of the module, before which is
    /// done what stands in `before`, and the host's end. Each complaint of the host is a failure.
    QStringList host(const QStringList& commands, const QStringList& before = {}) {
        const QStringList loading = {QStringLiteral("clicker " ORVELA_CLICKER),
                                     QStringLiteral("load ") + mModule};
        QStringList said = rawHost(before + loading + commands);
        EXPECT_EQ(said.isEmpty() ? QString() : said.takeLast(), "end");
        said.removeAll(QStringLiteral("loaded"));
        return said;
    }

    /// The same without the loading, and with the lines that stand for it.
    QStringList rawHost(const QStringList& commands) {
        QProcess process;
        process.setProcessEnvironment(mEnvironment);
        process.setWorkingDirectory(mFolder.path());
        process.start(mProgram.first(), mProgram.mid(1));
        EXPECT_TRUE(process.waitForStarted());
        process.write(commands.join(QLatin1Char('\n')).toUtf8() + '\n');
        process.closeWriteChannel();
        EXPECT_TRUE(process.waitForFinished(300000));
        EXPECT_EQ(process.exitStatus(), QProcess::NormalExit);
        EXPECT_EQ(process.exitCode(), 0) << process.readAllStandardError().toStdString();
        QStringList said =
            QString::fromUtf8(process.readAllStandardOutput()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        for (const QString& line : said)
            EXPECT_FALSE(line.startsWith(QLatin1String("WRONG"))) << line.toStdString();
        return said;
    }

    /// The lines of a log, the toolkit's own and addresses left out.
    QStringList log(const char* file = "orvela.log") const {
        QStringList lines = QString::fromUtf8(bytes(file)).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        lines.removeIf([](const QString& line) { return line.contains(QLatin1String("Qt: ")); });
        return lines;
    }

    QString mModule = QStringLiteral(ORVELA_MODULE);
    QStringList mProgram = {QStringLiteral(ORVELA_FOREIGN_HOST)};
    QProcessEnvironment mEnvironment;
};

/// A critical box of the module as the host's user stand-in prints it.
inline QString criticalBox(const QString& text, const QString& cause) {
    return QStringLiteral("box: Kestrand Orvela|%1/(%2)//If the problem persists, review the plug-in's log, "
                          "and contact/the Kestrand support team.|critical|OK")
        .arg(text, cause);
}

} // namespace orvela
