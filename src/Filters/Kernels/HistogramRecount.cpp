#include "Filters/Kernels/HistogramRecount.h"

#include "Filters/Kernels/PixelMath.h"
#include "Utility/RowScheduler.h"

#include <mutex>

namespace orvela {

namespace {

constexpr unsigned kPieceRows = 200;

struct Counts {
    using Table = std::array<std::uint32_t, 256>;
    Table red = {};
    Table green = {};
    Table blue = {};
    Table luma = {};

    void add(const Counts& other) {
        for (std::size_t i = 0; i < red.size(); ++i) {
            red[i] += other.red[i];
            green[i] += other.green[i];
            blue[i] += other.blue[i];
            luma[i] += other.luma[i];
        }
    }
};

Counts countPiece(const CARGBPlane& plane, unsigned begin, unsigned end, unsigned rowStep,
                  unsigned columnStep) {
    Counts counts;
    const std::uint32_t weight = rowStep * columnStep;
    const auto width = static_cast<unsigned>(plane.width());
    for (unsigned y = begin; y < end; y += rowStep) {
        const ConstRow in = plane.row(static_cast<int>(y));
        for (unsigned x = 0; x < width; x += columnStep) {
            counts.red[in[0][x]] += weight;
            counts.green[in[1][x]] += weight;
            counts.blue[in[2][x]] += weight;
            counts.luma[PixelMath::lumaOf(in[0][x], in[1][x], in[2][x])] += weight;
        }
    }
    return counts;
}

void store(const Counts::Table& table, Histogram& histogram) {
    for (std::size_t i = 0; i < table.size(); ++i)
        histogram[i] = table[i];
}

} // namespace

void recountHistograms(const CARGBPlane& plane, CUserParams& params, unsigned rowStep, unsigned columnStep) {
    Counts total;
    std::mutex mutex;
    const auto rows = static_cast<unsigned>(plane.height());
    orvela::forEachRange(0, rows, kPieceRows, [&](unsigned begin, unsigned end) {
        const Counts counts = countPiece(plane, begin, end, rowStep, columnStep);
        const std::lock_guard lock(mutex);
        total.add(counts);
    });
    store(total.luma, params.pHisto_Luma);
    store(total.red, params.pHisto_Red);
    store(total.green, params.pHisto_Green);
    store(total.blue, params.pHisto_Blue);
}

} // namespace orvela
