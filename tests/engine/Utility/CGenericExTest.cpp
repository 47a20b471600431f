#include "Utility/CGenericEx.h"

#include <QStringList>

#include <gtest/gtest.h>

#include <cstdlib>
#include <new>

using namespace orvela;

namespace {

// Destroyed after everything else: raises a failure then, when a test asks for it, and ends the process.
struct LastToGo {
    bool raises = false;
    ~LastToGo() {
        if (!raises)
            return;
        const CGenericEx late(QStringLiteral("late"), "f", 1);
        std::_Exit(ExceptionStack::entries() == QStringList(QStringLiteral("f:1 CGenericEx late")) ? 7 : 8);
    }
};
__attribute__((init_priority(101))) LastToGo gLast;

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

TEST(ExceptionStackDeathTest, RecordsWhenStaticObjectsAreGone) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(
        {
            const CGenericEx early(QStringLiteral("early"), "f", 0);
            gLast.raises = true;
            std::exit(0);
        },
        testing::ExitedWithCode(7), "");
}

} // namespace
