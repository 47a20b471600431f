#pragma once

#include <QColor>
#include <QRectF>

class QPainter;
class QPalette;

namespace orvela {

/// Drawing on whole device pixels, so that edges stay sharp at fractional scale factors too, and what the
/// controls have in common.
namespace CrispPaint {

/// Opacity of a control whose surroundings are disabled, which keeps its look otherwise.
inline constexpr double kDimmed = 0.6;

/// `rect` (logical pixels) moved to the nearest edges of device pixels.
QRectF onGrid(const QPainter& painter, const QRectF& rect);

/// Draws an outline about one logical pixel wide just inside `rect`.
void frame(QPainter& painter, const QRectF& rect, const QColor& color);

/// Draws the ring that shows the keyboard's focus along the inside of `rect`, in the colour of the texts.
void focusRing(QPainter& painter, const QRectF& rect, const QPalette& palette);

/// Whether the palette has light texts on a dark ground.
bool isDark(const QPalette& palette);

} // namespace CrispPaint

} // namespace orvela
