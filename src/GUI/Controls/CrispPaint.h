#pragma once

#include <QColor>
#include <QRectF>

class QPainter;

namespace orvela {

/// Drawing on whole device pixels, so that edges stay sharp at fractional scale factors too.
namespace CrispPaint {

/// `rect` (logical pixels) moved to the nearest edges of device pixels.
QRectF onGrid(const QPainter& painter, const QRectF& rect);

/// Draws an outline about one logical pixel wide just inside `rect`.
void frame(QPainter& painter, const QRectF& rect, const QColor& color);

} // namespace CrispPaint

} // namespace orvela
