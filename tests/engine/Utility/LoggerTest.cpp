#include "Utility/Logger.h"

#include "support/LastToGo.h"
#include "support/LogCapture.h"

#include <QTemporaryDir>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <stdexcept>

using namespace orvela;

namespace {

using testing::ElementsAre;

TEST(Logger, ScopesIndentTheLinesBetweenThem) {
    LogCapture log;
    Log::scopeExit(LogLevel::Debug, "depth stays %d", 0);
    Log::scopeEntry(LogLevel::Debug, "A");
    Log::log(LogLevel::Debug, "B");
    Log::setPrefixes(true);
    Log::log(LogLevel::Error, "x");
    Log::setPrefixes(false);
    Log::scopeExit(LogLevel::Debug, "A");
    EXPECT_THAT(log.lines(), ElementsAre("<- depth stays 0", "-> A", "\tB", "Err> \tx", "<- A"));
}

TEST(Logger, ThresholdDropsLinesButKeepsTheDepth) {
    LogCapture log;
    Log::log(LogLevel::User, "dropped");
    Log::setThreshold(LogLevel::Error);
    Log::scopeEntry(LogLevel::Debug, "dropped");
    Log::log(LogLevel::Error, "kept");
    EXPECT_THAT(log.lines(), ElementsAre("\tkept"));
}

TEST(Logger, LongTextsAreCutAtTheBuffersEnd) {
    LogCapture log;
    const std::string text(5000, 'm');
    Log::log(LogLevel::Debug, "%s", text.c_str());
    Log::scopeEntry(LogLevel::Debug, "%s%%", text.c_str());
    ASSERT_EQ(log.lines().size(), 2U);
    EXPECT_EQ(log.lines()[0], std::string(1023, 'm'));
    EXPECT_EQ(log.lines()[1], "-> " + std::string(1020, 'm'));
}

TEST(Logger, FileIsTruncatedAndHoldsEveryLineAtOnce) {
    const QTemporaryDir folder;
    const std::string path = folder.filePath("a.log").toStdString();
    std::ofstream(path) << "old";
    Log::install(std::make_unique<CLoggerFile>(QByteArray::fromStdString(path)));
    Log::setThreshold(LogLevel::Debug);
    Log::log(LogLevel::Debug, "100 %% done");
    std::ifstream file(path);
    const std::string text{std::istreambuf_iterator<char>(file), {}};
    Log::install(nullptr);
    EXPECT_EQ(text, "100 % done\n");
}

// Throws on lines that end with an exclamation mark, and logs its own end.
struct FailingSink final : ILogger {
    explicit FailingSink(std::vector<std::string>& lines) : mLines(lines) {}
    ~FailingSink() override { Log::log(LogLevel::Error, "gone"); }
    void write(const QByteArray& line) override {
        if (line.endsWith('!'))
            throw std::runtime_error("the disk is full");
        mLines.push_back(line.toStdString());
    }

    std::vector<std::string>& mLines;
};

TEST(Logger, AFailingReceiverLosesItsLineAndNothingElse) {
    std::vector<std::string> lines;
    Log::install(std::make_unique<FailingSink>(lines));
    Log::setThreshold(LogLevel::Debug);
    Log::scopeEntry(LogLevel::Debug, "in!");
    Log::log(LogLevel::Debug, "inside");
    Log::scopeExit(LogLevel::Debug, "out!");
    Log::log(LogLevel::Debug, "outside");
    const LogCapture next;
    EXPECT_THAT(lines, ElementsAre("\tinside", "outside"));
    EXPECT_THAT(next.lines(), ElementsAre("gone")) << "a receiver may log while it is replaced";
}

// Ends the process at any line.
struct EndingSink final : ILogger {
    void write(const QByteArray&) override { std::_Exit(8); }
};

TEST(LoggerDeathTest, DropsLinesWhenStaticObjectsAreGone) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(
        {
            Log::install(std::make_unique<EndingSink>());
            endWith([] {
                Log::log(LogLevel::Error, "late");
                return 7;
            });
            std::exit(0);
        },
        testing::ExitedWithCode(7), "");
}

} // namespace
