#include "GUI/Controls/CrispPaint.h"

#include <QPainter>
#include <QPalette>

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

void focusRing(QPainter& painter, const QRectF& rect, const QPalette& palette) {
    constexpr double kLine = 1.5;
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(palette.color(QPalette::WindowText), kLine));
    const double inset = kLine / 2;
    const QRectF ring = rect.adjusted(inset, inset, -inset, -inset);
    const double radius = std::min({4.0, ring.width() / 2, ring.height() / 2});
    painter.drawRoundedRect(ring, radius, radius);
    painter.restore();
}

bool isDark(const QPalette& palette) {
    const auto lightness = [&palette](auto role) {
        return palette.color(QPalette::Active, role).lightness();
    };
    return lightness(QPalette::Window) < lightness(QPalette::WindowText);
}

} // namespace CrispPaint

} // namespace orvela
