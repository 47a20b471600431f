#include "Core/Snapshot.h"

#include "Utility/RowScheduler.h"

#include <algorithm>

namespace orvela {

namespace {

// Mean of the pixels of one channel, rounded.
std::uint8_t meanOf(const CARGBPlane& picture, std::size_t channel, const QRect& block) {
    std::uint64_t sum = 0;
    for (int y = block.top(); y <= block.bottom(); ++y) {
        const std::uint8_t* row = picture.row(y)[channel];
        for (int x = block.left(); x <= block.right(); ++x)
            sum += row[x];
    }
    const auto count = static_cast<std::uint64_t>(block.width()) * static_cast<std::uint64_t>(block.height());
    return static_cast<std::uint8_t>((sum + count / 2) / count);
}

void reduceRow(const CARGBPlane& picture, const QRect& part, int reduction, CARGBPlane& snapshot, int y) {
    const ConstRow in = picture.row(part.top() + y * reduction);
    const Row out = snapshot.row(y);
    for (std::size_t c = 0; c < out.size(); ++c) {
        if (reduction == 1) {
            std::copy_n(in[c] + part.left(), part.width(), out[c]);
            continue;
        }
        for (int x = 0; x < snapshot.width(); ++x) {
            const QPoint corner(part.left() + x * reduction, part.top() + y * reduction);
            out[c][x] = meanOf(picture, c, QRect(corner, QSize(reduction, reduction)) & part);
        }
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
            reduceRow(picture, part, step, *snapshot, static_cast<int>(y));
    });
    return snapshot;
}

} // namespace orvela
