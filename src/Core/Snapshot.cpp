#include "Core/Snapshot.h"

#include "Utility/RowScheduler.h"

#include <algorithm>
#include <cstdint>
#include <numeric>
#include <vector>

namespace orvela {

namespace {

// Sums of the columns of one channel over neighbouring rows.
std::vector<std::uint32_t> columnSums(const CARGBPlane& picture, std::size_t channel, const QRect& rows) {
    std::vector<std::uint32_t> sums(static_cast<std::size_t>(rows.width()), 0);
    for (int y = rows.top(); y <= rows.bottom(); ++y) {
        const std::uint8_t* in = picture.row(y)[channel] + rows.left();
        for (std::size_t x = 0; x < sums.size(); ++x)
            sums[x] += in[x];
    }
    return sums;
}

void reduceRow(const CARGBPlane& picture, const QRect& rows, int reduction, std::size_t channel,
               std::uint8_t* out) {
    const std::vector<std::uint32_t> sums = columnSums(picture, channel, rows);
    const auto step = static_cast<std::size_t>(reduction);
    for (std::size_t first = 0; first < sums.size(); first += step) {
        const std::size_t last = std::min(first + step, sums.size());
        const std::uint64_t sum = std::accumulate(&sums[first], sums.data() + last, std::uint64_t{0});
        const std::uint64_t count = (last - first) * static_cast<std::uint64_t>(rows.height());
        *out++ = static_cast<std::uint8_t>((sum + count / 2) / count);
    }
}

void takeRow(const CARGBPlane& picture, const QRect& part, int reduction, CARGBPlane& snapshot, int y) {
    const QRect rows = QRect(part.left(), part.top() + y * reduction, part.width(), reduction) & part;
    const ConstRow in = picture.row(rows.top());
    const Row out = snapshot.row(y);
    for (std::size_t c = 0; c < out.size(); ++c) {
        if (reduction == 1)
            std::copy_n(in[c] + part.left(), part.width(), out[c]);
        else
            reduceRow(picture, rows, reduction, c, out[c]);
    }
}

} // namespace

std::unique_ptr<CARGBPlane> takeSnapshot(const CARGBPlane& picture, const QRect& area, int reduction) {
    const QRect part = area & QRect(0, 0, picture.width(), picture.height());
    const int step = std::clamp(reduction, 1, std::max({part.width(), part.height(), 1}));
    auto snapshot = std::make_unique<CARGBPlane>(
        (part.width() + step - 1) / step, (part.height() + step - 1) / step, QStringLiteral("Snapshot"));
    snapshot->setColorMode(picture.colorMode());
    forEachRange(0, static_cast<unsigned>(snapshot->height()), 1, [&](unsigned first, unsigned last) {
        for (unsigned y = first; y < last; ++y)
            takeRow(picture, part, step, *snapshot, static_cast<int>(y));
    });
    return snapshot;
}

} // namespace orvela
