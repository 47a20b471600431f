#include "ProgramRun.h"
#include "common/PhotographReader.h"
#include "common/PhotographWriter.h"

#include <QElapsedTimer>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QThread>

#include <pty.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

using namespace orvela;

namespace {

// What the program writes to a terminal on its standard error.
std::string onTerminal(const QString& folder, std::vector<const char*> arguments) {
    int terminal = -1;
    const pid_t child = forkpty(&terminal, nullptr, nullptr, nullptr);
    if (child == 0) {
        if (chdir(qPrintable(folder)) == 0) {
            arguments.insert(arguments.begin(), "orvela");
            arguments.push_back(nullptr);
            execv(ORVELA_PROGRAM, const_cast<char**>(arguments.data()));
        }
        _exit(99);
    }
    std::string text;
    char piece[4096];
    for (ssize_t count; (count = read(terminal, piece, sizeof piece)) > 0;)
        text.append(piece, static_cast<std::size_t>(count));
    close(terminal);
    waitpid(child, nullptr, 0);
    return text;
}

class LongRunTest : public ProgramTest {
protected:
    // A picture that takes seconds.
    void largePicture(const char* name) const {
        Photograph photograph;
        photograph.width = 5000;
        photograph.height = 4000;
        photograph.samples.resize(60'000'000);
        for (std::size_t i = 0; i < photograph.samples.size(); ++i)
            photograph.samples[i] = static_cast<std::uint8_t>(i * 2654435761U >> 13);
        WriteOptions options;
        options.compression = "none";
        writePhotograph(photograph, path(name).toStdString(), options);
    }

    // Sends the signal once the log shows that the engine is at work; the time until the end in milliseconds.
    qint64 interrupt(QProcess& process, int signal, int times) {
        while (!bytes("log").contains("Pre DoApplyParallel") && process.state() == QProcess::Running)
            QThread::msleep(2);
        QElapsedTimer timer;
        timer.start();
        for (int i = 0; i < times; ++i)
            kill(static_cast<pid_t>(process.processId()), signal);
        process.waitForFinished(60000);
        return timer.elapsed();
    }
};

TEST_F(LongRunTest, SignalsStopTheRunAndLeaveNothing) {
    largePicture("big.tif");
    for (const auto& [signal, times] : {std::pair(SIGINT, 1), {SIGTERM, 1}, {SIGINT, 2}}) {
        QProcess process;
        begin(process, "enhance big.tif big.tif --mode landscapepro --log log");
        const qint64 milliseconds = interrupt(process, signal, times);
        const Answer answer = finish(process);
        EXPECT_EQ(answer.status, 128 + signal);
        EXPECT_EQ(answer.out, "");
        EXPECT_LT(milliseconds, 5000);
        EXPECT_EQ(files(), QStringList({QStringLiteral("big.tif"), QStringLiteral("log")}));
        QFile::remove(path("log"));
    }
}

TEST_F(LongRunTest, ATerminalShowsProgressAndAPipeDoesNot) {
    sample("a%1.png");
    const std::string text = onTerminal(mFolder.path(), {"enhance", "a%1.png"});
    EXPECT_NE(text.find("[1/1] a%1.png  Orvela (Iteration Phase I)  "), std::string::npos) << text;
    EXPECT_NE(text.find(" %"), std::string::npos);
    EXPECT_TRUE(text.ends_with("\r\x1b[Ka%1.png -> a%1-enhanced.png\r\n")) << text;
    EXPECT_EQ(onTerminal(mFolder.path(), {"enhance", "a%1.png", "--quiet", "--force"}), "");
    EXPECT_EQ(orvela("enhance a%1.png --force").err, "");
}

TEST_F(LongRunTest, TheTraceShowsEveryStepThatChangedThePicture) {
    sample("a.png");
    ASSERT_EQ(orvela("enhance a.png --mode autocolor -o x.png --trace t").status, 0);
    const QStringList traced = files("t");
    ASSERT_GE(traced.size(), 2);
    EXPECT_TRUE(traced[0].startsWith(QStringLiteral("01-")) && traced[0].endsWith(QStringLiteral(".json")));
    const QJsonObject step = QJsonDocument::fromJson(bytes(qPrintable("t/" + traced[0]))).object();
    const QJsonObject dark = step["statistics"].toObject()["m_Dark_Acu"].toObject();
    EXPECT_TRUE(dark["value"].toDouble() > 0 && dark["range"].toArray()[1] == 1) << "a share";
    EXPECT_EQ(dark["writer"], "CHistogram0");
    EXPECT_TRUE(dark["meaning"].toString().contains("luma from 1 to 85"));
    EXPECT_EQ(step["histograms"].toObject()["luma"].toArray().size(), 256);
    const Photograph last = readPhotograph(path(qPrintable("t/" + traced.last())).toStdString());
    EXPECT_EQ(last.samples, readPhotograph(path("x.png").toStdString()).samples);
    EXPECT_EQ(orvela("enhance a.png -o z.png --trace t").status, 4);
    EXPECT_EQ(orvela("enhance a.png x.png -d two --trace two-traces").status, 0);
    EXPECT_EQ(files("two-traces"), QStringList({QStringLiteral("1-a.png"), QStringLiteral("2-x.png")}));
    // No step, no file.
    ASSERT_EQ(orvela("enhance a.png --mode advanced -o n.png --trace none").status, 0);
    EXPECT_EQ(files("none"), QStringList());
}

} // namespace
