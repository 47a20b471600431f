#include "GUI/Preview/CGridCell.h"

#include "Core/Snapshot.h"
#include "Utility/Logger.h"

#include <QImage>
#include <QPainter>
#include <QStyleOptionGraphicsItem>

#include <algorithm>
#include <cmath>
#include <new>
#include <utility>

using namespace orvela;

namespace {

constexpr int kLastLevel = 15;    // of the widest picture there is remain a few pixels
constexpr double kPixelsSeen = 2; // from this enlargement on the pixels themselves are looked at

QImage imageOf(const CARGBPlane& plane, const QRect& part) {
    QImage image(part.size(), QImage::Format_RGB32);
    if (image.isNull())
        throw std::bad_alloc();
    const bool grey = plane.colorMode() == CARGBPlane::Grayscale;
    for (int y = part.top(); y <= part.bottom(); ++y) {
        const ConstRow row = plane.row(y);
        auto* out = reinterpret_cast<QRgb*>(image.scanLine(y - part.top()));
        for (int x = part.left(); x <= part.right(); ++x)
            *out++ = grey ? qRgb(row[0][x], row[0][x], row[0][x]) : qRgb(row[0][x], row[1][x], row[2][x]);
    }
    return image;
}

} // namespace

CGridCell::CGridCell(const CARGBPlane& plane, int left, int top, int right, int bottom)
    : mPlane(plane), mLeft(left), mTop(top), mRight(right), mBottom(bottom) {}

QRectF CGridCell::boundingRect() const {
    return QRectF(QPointF(0, 0), QSizeF(part().size()));
}

// Nothing may be thrown through the event loop: a tile that finds no memory is left out.
void CGridCell::paint(QPainter* painter, const QStyleOptionGraphicsItem*, QWidget*) {
    try {
        paintTile(*painter);
    } catch (const std::exception& error) {
        if (!std::exchange(mFailed, true))
            Log::log(LogLevel::Warning, "A preview cannot be painted: %s", error.what());
    }
}

void CGridCell::paintTile(QPainter& painter) {
    const double scale = QStyleOptionGraphicsItem::levelOfDetailFromTransform(painter.deviceTransform());
    const int level =
        scale > 0 ? std::clamp(static_cast<int>(std::floor(-std::log2(scale))), 0, kLastLevel) : kLastLevel;
    painter.setRenderHint(QPainter::SmoothPixmapTransform, scale < kPixelsSeen);
    // The last column and row of a reduced copy may stand for fewer pixels than the others.
    const QSizeF shown = QSizeF(part().size()) / (1 << level);
    painter.drawPixmap(boundingRect(), pixmapFor(level), QRectF(QPointF(0, 0), shown));
}

const QPixmap& CGridCell::pixmapFor(int level) {
    QPixmap& pixmap = mPixmaps[level];
    if (!pixmap.isNull())
        return pixmap;
    if (level == 0) {
        pixmap = QPixmap::fromImage(imageOf(mPlane, part()));
        return pixmap;
    }
    const std::unique_ptr<CARGBPlane> reduced = takeSnapshot(mPlane, part(), 1 << level);
    pixmap = QPixmap::fromImage(imageOf(*reduced, QRect(0, 0, reduced->width(), reduced->height())));
    return pixmap;
}
