#include "GUI/Controls/CrispPaint.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace orvela {

namespace CrispPaint {

QRectF onGrid(const QPainter& painter, const QRectF& rect) {
    const QTransform toDevice = painter.deviceTransform();
    const QRectF device = toDevice.mapRect(rect);
    const QPointF topLeft(std::round(device.left()), std::round(device.top()));
    const QPointF bottomRight(std::round(device.right()), std::round(device.bottom()));
    return toDevice.inverted().mapRect(QRectF(topLeft, bottomRight));
}

void frame(QPainter& painter, const QRectF& rect, const QColor& color) {
    const QRectF outer = onGrid(painter, rect);
    const double scale = painter.deviceTransform().m11();
    const double line = std::max(1.0, std::floor(scale)) / scale;
    painter.fillRect(QRectF(outer.left(), outer.top(), outer.width(), line), color);
    painter.fillRect(QRectF(outer.left(), outer.bottom() - line, outer.width(), line), color);
    painter.fillRect(QRectF(outer.left(), outer.top(), line, outer.height()), color);
    painter.fillRect(QRectF(outer.right() - line, outer.top(), line, outer.height()), color);
}

} // namespace CrispPaint

} // namespace orvela
