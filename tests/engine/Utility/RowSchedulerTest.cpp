#include "Utility/RowScheduler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

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
