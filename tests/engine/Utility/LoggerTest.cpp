#include "Utility/Logger.h"

#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"

#include <QStringList>
#include <QTemporaryDir>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <thread>

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

TEST(ExceptionStack, ListsNewestFirstAndKnowsTheOldest) {
    LogCapture log;
    try {
        throw CGenericEx(QStringLiteral("A"), "C:\\src\\deep\\a.cpp", 1);
    } catch (const CGenericEx& a) {
        EXPECT_EQ(a.sourceFile(), "a.cpp");
        const COutOfMemoryEx b(QStringLiteral("B %1"), "x/y", 2);
        const CBadPtrEx c(QStringLiteral("C"), nullptr, 3);
    }
    EXPECT_EQ(ExceptionStack::oldestMessage(), "A");
    ExceptionStack::writeToLog(true);
    EXPECT_THAT(log.lines(),
                ElementsAre("-> Exception Stack:", "\t :3 CBadPtrEx C", "\t x/y:2 COutOfMemoryEx B %1",
                            "\t a.cpp:1 CGenericEx A", "<- End Stack."));
    EXPECT_TRUE(ExceptionStack::oldestMessage().isNull());
}

TEST(ExceptionStack, RecordsFromSeveralThreadsWithoutLoss) {
    LogCapture log;
    const auto raise = [] {
        for (int i = 0; i < 200; ++i) {
            const CGenericEx failure(QStringLiteral("x"), "f", i);
            Log::log(LogLevel::Debug, "line");
        }
    };
    std::thread other(raise);
    raise();
    other.join();
    EXPECT_EQ(ExceptionStack::entries().size(), 400);
    EXPECT_EQ(log.lines().size(), 400U);
}

} // namespace
