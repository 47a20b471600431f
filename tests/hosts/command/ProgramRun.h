#pragma once

#include <QDir>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <string>

namespace orvela {

/// What the program answered.
struct Answer {
    int status = -1;
    std::string out;
    std::string err;

    bool says(const std::string& text) const { return (out + err).find(text) != std::string::npos; }
};

/// Runs the built program as a user does, in a folder of its own.
class ProgramTest : public testing::Test {
protected:
    /// Runs `orvela` with the arguments, which are parted by blanks but in double quotes.
    Answer orvela(const char* arguments) {
        QProcess process;
        begin(process, arguments);
        return finish(process);
    }

    void begin(QProcess& process, const char* arguments, const char* program = ORVELA_PROGRAM) {
        process.setWorkingDirectory(mFolder.path());
        process.start(QString::fromUtf8(program), QProcess::splitCommand(QString::fromUtf8(arguments)));
        ASSERT_TRUE(process.waitForStarted());
    }

    Answer finish(QProcess& process) {
        EXPECT_TRUE(process.state() == QProcess::NotRunning || process.waitForFinished(120000));
        EXPECT_EQ(process.exitStatus(), QProcess::NormalExit);
        return {process.exitCode(), process.readAllStandardOutput().toStdString(),
                process.readAllStandardError().toStdString()};
    }

    QString path(const char* name) const { return mFolder.filePath(QString::fromUtf8(name)); }
    bool exists(const char* name) const { return QFile::exists(path(name)); }

    /// Puts the bundled sample there under that name.
    void sample(const char* name) const {
        QDir(mFolder.path()).mkpath(QFileInfo(path(name)).path());
        ASSERT_TRUE(QFile::copy(QStringLiteral(ORVELA_SAMPLES "/coffee.png"), path(name)));
    }

    void store(const char* name, const QByteArray& bytes) const {
        QFile file(path(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }

    QByteArray bytes(const char* name) const {
        QFile file(path(name));
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

    QStringList files(const char* folder = ".") const {
        return QDir(path(folder)).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
    }

    QTemporaryDir mFolder;
};

} // namespace orvela
