#include "Utility/RowScheduler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>

#include <atomic>
#include <cstdlib>
#include <fstream>
#include <mutex>
#include <set>

TEST(RowScheduler, PiecesHalveDownToTheGrainAndCoverTheRange) {
    std::mutex mutex;
    std::set<std::pair<unsigned, unsigned>> pieces;
    orvela::forEachRange(0, 202, 200, [&](unsigned begin, unsigned end) {
        const std::lock_guard lock(mutex);
        pieces.insert({begin, end});
    });
    EXPECT_THAT(pieces, testing::ElementsAre(std::pair{0U, 101U}, std::pair{101U, 202U}));
}

// The stack of one more thread fits below the limit, those of three do not.
TEST(RowScheduler, DoesWithoutThreadsThatTheSystemRefuses) {
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
    GTEST_SKIP() << "the sanitizers need more address space";
#endif
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    const auto work = [] {
        ::alarm(20);
        rlim_t pages = 0;
        std::ifstream("/proc/self/statm") >> pages;
        const rlim_t bytes = pages * static_cast<rlim_t>(::sysconf(_SC_PAGESIZE)) + (12 << 20);
        const rlimit limit{bytes, bytes};
        ::setrlimit(RLIMIT_AS, &limit);
        std::atomic<unsigned> sum = 0;
        {
            orvela::RowScheduler scheduler(4);
            scheduler.execute(
                [&] { orvela::forEachRange(0, 1000, 1, [&](unsigned begin, unsigned) { sum += begin; }); });
        }
        std::_Exit(sum == 499500 ? 0 : 1);
    };
    EXPECT_EXIT(work(), testing::ExitedWithCode(0), "");
}
