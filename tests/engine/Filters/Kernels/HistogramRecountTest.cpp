#include "Filters/Kernels/HistogramRecount.h"

#include "Histograms/IHistogram.h"
#include "support/StatisticMap.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

using testplanes::Pixel;

TEST(HistogramRecount, SamplesStartAnewInEachPiece) {
    struct Piece {
        int rows, split;
    };
    for (const auto& [rows, split] : {Piece{200, 200}, Piece{201, 100}, Piece{202, 101}}) {
        const auto plane = testplanes::make(3, rows, [](int, int y) {
            return Pixel{static_cast<std::uint8_t>(y), static_cast<std::uint8_t>(y),
                         static_cast<std::uint8_t>(y)};
        });
        CUserParams params;
        recountHistograms(*plane, params, 5, 1);
        for (int y = 0; y < 256; ++y) {
            const bool sampled = y < rows && (y < split ? y : y - split) % 5 == 0;
            EXPECT_EQ(params.pHisto_Luma[static_cast<std::size_t>(y)], sampled ? 15 : 0) << rows << ' ' << y;
        }
    }
}

TEST(HistogramRecount, WeighsTheSamplesOfEveryChannelAndNothingElse) {
    const auto plane = testplanes::make(7, 10, [](int x, int y) {
        return x % 3 == 0 && y % 3 == 0 ? Pixel{11, 22, 34} : Pixel{1, 1, 0};
    });
    CUserParams params;
    markStatistics(params);
    params.mCancelRequested = true;
    params.mProgressCallback = [](std::int32_t) { ADD_FAILURE() << "progress"; };
    params.pHisto_Red.fill(9);
    const auto before = statistics(params);
    recountHistograms(*plane, params, 3, 3);
    EXPECT_EQ(params.pHisto_Red[11], 9 * 3 * 4);
    EXPECT_EQ(params.pHisto_Luma[22], 9 * 3 * 4);
    EXPECT_EQ(sumOf(params.pHisto_Red, 0, 255), 9 * 3 * 4);
    recountHistograms(*plane, params, 1, 1);
    EXPECT_EQ(params.pHisto_Green[22], 12);
    EXPECT_EQ(params.pHisto_Blue[34], 12);
    EXPECT_EQ(params.pHisto_Luma[0], 58);
    EXPECT_EQ(statistics(params), before);
}
