#include "ProgramRun.h"
#include "files/PhotographWriter.h"
#include "hosts/TestPhotograph.h"

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
        const Photograph photograph = testPhotograph(ColorModel::Rgb, 8, 5000, 4000,
                                                     [](std::size_t i) { return i * 2654435761U >> 13; });
        WriteOptions options;
        options.compression = "none";
        writePhotograph(photograph, path(name).toStdString(), options);
    }

    // What the log holds that is being written.
    QByteArray growingLog() const {
        const QStringList found =
            QDir(path(".")).entryList({QStringLiteral(".log.*.part")}, QDir::Files | QDir::Hidden);
        return found.isEmpty() ? QByteArray() : bytes(qPrintable(found.front()));
    }

    // Sends the signal once the log shows that the engine is at work.
    void interrupt(QProcess& process, int signal, int times) {
        while (!growingLog().contains("Pre DoApplyParallel")) {
            process.waitForFinished(2);
            ASSERT_EQ(process.state(), QProcess::Running) << "it ended before it was at work";
        }
        for (int i = 0; i < times; ++i)
            kill(static_cast<pid_t>(process.processId()), signal);
    }
};

TEST_F(LongRunTest, SignalsStopTheRunAndLeaveNothing) {
    largePicture("big.tif");
    for (const auto& [signal, times] : {std::pair(SIGINT, 1), {SIGTERM, 1}, {SIGINT, 2}}) {
        QProcess process;
        begin(process, "enhance big.tif big.tif --mode landscapepro --log log");
        interrupt(process, signal, times);
        const Answer answer = finish(process);
        EXPECT_EQ(answer.status, 128 + signal);
        EXPECT_EQ(answer.out, "");
        EXPECT_EQ(files(), QStringList({QStringLiteral("big.tif"), QStringLiteral("log")}));
        QFile::remove(path("log"));
    }
}

// Also while the photograph is read.
TEST_F(LongRunTest, SignalsLeaveALogWhole) {
    largePicture("big.tif");
    QProcess process;
    begin(process, "enhance big.tif --log log");
    while (files().size() < 2) {
        process.waitForFinished(1);
        ASSERT_EQ(process.state(), QProcess::Running) << "it ended before there was a log";
    }
    kill(static_cast<pid_t>(process.processId()), SIGTERM);
    EXPECT_EQ(finish(process).status, 128 + SIGTERM);
    EXPECT_EQ(files(), QStringList({QStringLiteral("big.tif"), QStringLiteral("log")}));
}

// From the second page on there is a part of the result, which must not stay.
TEST_F(LongRunTest, SignalsLeaveNoPartOfSeveralPages) {
    largePicture("big.tif");
    ASSERT_EQ(QProcess::execute("convert", {ORVELA_SAMPLES "/coffee.png", path("big.tif"), path("s.tif")}),
              0);
    QFile::remove(path("big.tif"));
    for (const int delay : {0, 100, 400}) { // while the second page is read and while it is enhanced
        QProcess process;
        begin(process, "enhance s.tif --mode landscapepro");
        while (files().size() < 2) {
            process.waitForFinished(2);
            ASSERT_EQ(process.state(), QProcess::Running) << "it ended before there was a part";
        }
        process.waitForFinished(delay);
        kill(static_cast<pid_t>(process.processId()), SIGTERM);
        EXPECT_EQ(finish(process).status, 128 + SIGTERM);
        EXPECT_EQ(files(), QStringList(QStringLiteral("s.tif"))) << delay;
    }
}

TEST_F(LongRunTest, ATerminalShowsProgressAndAPipeDoesNot) {
    sample("a%1.png");
    const std::string text = onTerminal(mFolder.path(), {"enhance", "a%1.png"});
    EXPECT_NE(text.find("[1/1] a%1.png  Illumination, first pass  "), std::string::npos) << text;
    EXPECT_NE(text.find(" %"), std::string::npos);
    EXPECT_TRUE(text.ends_with("\r\x1b[Ka%1.png -> a%1-enhanced.png\r\n")) << text;
    EXPECT_EQ(onTerminal(mFolder.path(), {"enhance", "a%1.png", "--quiet", "--force"}), "");
    ASSERT_EQ(QProcess::execute("convert", {path("a%1.png"), path("a%1.png"), path("s.tif")}), 0);
    const std::string pages = onTerminal(mFolder.path(), {"enhance", "s.tif"});
    EXPECT_NE(pages.find("[1/1] s.tif  page 1 of 2  Illumination, first pass  "), std::string::npos) << pages;
    EXPECT_NE(pages.find("[1/1] s.tif  page 2 of 2  Reading  50 %"), std::string::npos) << pages;
    EXPECT_EQ(orvela("enhance a%1.png --force").err, "");
}

} // namespace
