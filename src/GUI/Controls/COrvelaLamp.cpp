#include "GUI/Controls/COrvelaLamp.h"

#include "GUI/Controls/CrispPaint.h"

#include <QMouseEvent>
#include <QPainter>

#include <algorithm>

using namespace orvela;

namespace {

const QColor kCore(255, 236, 150);
const QColor kRim(255, 166, 0);
const QColor kLitOutline(150, 90, 0);

} // namespace

COrvelaLamp::COrvelaLamp(QWidget* parent) : QAbstractButton(parent) {
    setCheckable(true);
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Expanding); // the row's whole height takes the click
}

QSize COrvelaLamp::sizeHint() const {
    const int side = std::max(14, fontMetrics().height());
    return {side, side};
}

// The first press of a double click has switched already.
void COrvelaLamp::mouseDoubleClickEvent(QMouseEvent* event) {
    event->accept();
}

void COrvelaLamp::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setOpacity(isEnabled() ? 1 : CrispPaint::kDimmed);
    const QPointF center = QRectF(rect()).center();
    const double radius = std::min(width(), height()) / 2.0 - 3;
    QColor outline = kLitOutline;
    if (isChecked()) {
        QRadialGradient light(center, radius);
        light.setColorAt(0, kCore);
        light.setColorAt(1, kRim);
        painter.setBrush(light);
    } else {
        outline = palette().color(QPalette::Active, QPalette::WindowText);
        outline.setAlphaF(0.5F);
    }
    painter.setPen(QPen(outline, 1));
    painter.drawEllipse(center, radius, radius);
    const double side = 2 * (radius + 3);
    if (hasFocus())
        CrispPaint::focusRing(painter, {center.x() - side / 2, center.y() - side / 2, side, side}, palette());
}
