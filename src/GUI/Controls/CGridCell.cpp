#include "GUI/Controls/CGridCell.h"

#include <QImage>

using namespace orvela;

CGridCell::CGridCell(const CARGBPlane& plane, int left, int top, int right, int bottom)
    : mPlane(plane), mLeft(left), mTop(top), mRight(right), mBottom(bottom) {}

QRectF CGridCell::boundingRect() const {
    return QRectF(0, 0, mRight - mLeft + 1, mBottom - mTop + 1);
}

void CGridCell::paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) {
    if (mNeedsRebuild)
        rebuild();
    QGraphicsPixmapItem::paint(painter, option, widget);
}

void CGridCell::rebuild() {
    QImage image(mRight - mLeft + 1, mBottom - mTop + 1, QImage::Format_RGB32);
    const bool grey = mPlane.colorMode() == CARGBPlane::Grayscale;
    for (int y = mTop; y <= mBottom; ++y) {
        const ConstRow row = mPlane.row(y);
        auto* out = reinterpret_cast<QRgb*>(image.scanLine(y - mTop));
        for (int x = mLeft; x <= mRight; ++x)
            *out++ = grey ? qRgb(row[0][x], row[0][x], row[0][x]) : qRgb(row[0][x], row[1][x], row[2][x]);
    }
    setPixmap(QPixmap::fromImage(image));
    mNeedsRebuild = false;
}
