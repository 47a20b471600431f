#include "Utility/CGenericEx.h"

#include "support/LastToGo.h"
#include "support/LogCapture.h"

#include <QStringList>

#include <gmock/gmock.h>

#include <cstdlib>
#include <new>
#include <thread>

using namespace orvela;

namespace {

using testing::ElementsAre;

// What reaches the outermost handler when two layers wrap `cause` with texts of their own.
template <typename Cause, typename Check>
void wrapTwice(const Cause& cause, Check check) {
    ExceptionStack::clear();
    try {
        try {
            try {
                throw cause;
            } catch (...) {
                std::throw_with_nested(CBadPtrEx(QStringLiteral("Größe"), "a", 1));
            }
        } catch (...) {
            std::throw_with_nested(CGenericEx(QStringLiteral("outer"), "b", 2));
        }
    } catch (const CGenericEx& failure) {
        EXPECT_STREQ(failure.what(), "outer");
        check(failure);
    }
    EXPECT_EQ(ExceptionStack::entries(),
              QStringList({QStringLiteral("b:2 CGenericEx outer"), QStringLiteral("a:1 CBadPtrEx Größe")}));
}

TEST(CGenericEx, WrappingKeepsTheCauseAndRecordsEachFailureOnce) {
    wrapTwice(std::bad_alloc(), [](const std::exception& failure) { EXPECT_TRUE(isOutOfMemory(failure)); });
    wrapTwice(std::runtime_error("cause"), [](const std::exception& failure) {
        EXPECT_EQ(innermostMessage(failure), "cause");
        EXPECT_FALSE(isOutOfMemory(failure));
    });
    wrapTwice(5, [](const std::exception& failure) {
        EXPECT_EQ(innermostMessage(failure), QStringLiteral("Größe")); // what is no exception has no message
        EXPECT_FALSE(isOutOfMemory(failure));
    });
    const COutOfMemoryEx plain(QStringLiteral("plain"), "c", 3);
    EXPECT_TRUE(isOutOfMemory(plain));
    EXPECT_EQ(innermostMessage(plain), "plain");
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

TEST(ExceptionStackDeathTest, RecordsWhenStaticObjectsAreGone) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(
        {
            const CGenericEx early(QStringLiteral("early"), "f", 0);
            endWith([] {
                const CGenericEx late(QStringLiteral("late"), "f", 1);
                return ExceptionStack::entries() == QStringList("f:1 CGenericEx late") ? 7 : 8;
            });
            std::exit(0);
        },
        testing::ExitedWithCode(7), "");
}

} // namespace
