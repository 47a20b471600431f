#include "GUI/Controls/CThinHorizontalSlider.h"

#include "GUI/Controls/ControlAccessibility.h"
#include "GUI/Controls/CrispPaint.h"
#include "Utility/Logger.h"

#include <QAccessible>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

constexpr int kHeight = 7;
constexpr int kHandleWidth = 5;
constexpr double kStepShare = 0.01; // of the range, per arrow key and wheel notch
constexpr double kPageShare = 0.1;
constexpr double kWheelNotch = 120; // eighths of a degree
const QColor kOffFill(200, 200, 200);
const QColor kOutline(110, 110, 110);

} // namespace

CThinHorizontalSlider::CThinHorizontalSlider(QWidget* parent) : QWidget(parent) {
    installControlAccessibility();
    setFixedHeight(kHeight);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    setFocusPolicy(Qt::StrongFocus);
    mStepper = [this](double value, double delta) { return std::clamp(value + delta, mMinimum, mMaximum); };
}

QSize CThinHorizontalSlider::sizeHint() const {
    return {100, kHeight};
}

void CThinHorizontalSlider::setZoneStops(const QList<ZoneStop>& stops) {
    mStops = stops;
    update();
}

void CThinHorizontalSlider::setMinimum(double dNewMin) {
    mMinimum = dNewMin;
    update();
}

void CThinHorizontalSlider::setMaximum(double dNewMax) {
    mMaximum = dNewMax;
    update();
}

void CThinHorizontalSlider::setValue(double dNewVal) {
    mValue = dNewVal;
    update();
    QAccessibleValueChangeEvent change(this, mValue);
    QAccessible::updateAccessibility(&change);
}

void CThinHorizontalSlider::moveTo(double value) {
    setValue(std::clamp(value, mMinimum, mMaximum));
    Q_EMIT valueChanged(mValue);
}

void CThinHorizontalSlider::mousePressEvent(QMouseEvent* event) {
    mDragging = true;
    setMouseTracking(true);
    handlePoint(event->position());
}

void CThinHorizontalSlider::mouseMoveEvent(QMouseEvent* event) {
    handlePoint(event->position());
}

void CThinHorizontalSlider::mouseReleaseEvent(QMouseEvent* event) {
    if (!mDragging)
        return;
    mDragging = false;
    setMouseTracking(false);
    handlePoint(event->position());
    update();
}

void CThinHorizontalSlider::mouseDoubleClickEvent(QMouseEvent* event) {
    event->ignore(); // the surrounding block switches itself on or off
}

void CThinHorizontalSlider::handlePoint(const QPointF& point) {
    const int last = width() - 1;
    const int x = std::clamp(point.toPoint().x() - 1, 0, std::max(last, 0));
    setValue(last > 0 ? (mMaximum - mMinimum) / last * x : 0);
    Q_EMIT valueChanged(mValue);
}

void CThinHorizontalSlider::wheelEvent(QWheelEvent* event) {
    if (!hasFocus()) {
        event->ignore(); // the surroundings scroll
        return;
    }
    mWheelRest += event->angleDelta().y() / kWheelNotch;
    const double notches = std::trunc(mWheelRest);
    mWheelRest -= notches;
    if (notches != 0)
        stepBy(notches * kStepShare * (mMaximum - mMinimum));
    event->accept();
}

void CThinHorizontalSlider::keyPressEvent(QKeyEvent* event) {
    const double range = mMaximum - mMinimum;
    switch (event->key()) {
    case Qt::Key_Left:
    case Qt::Key_Down:
        return stepBy(-kStepShare * range);
    case Qt::Key_Right:
    case Qt::Key_Up:
        return stepBy(kStepShare * range);
    case Qt::Key_PageDown:
        return stepBy(-kPageShare * range);
    case Qt::Key_PageUp:
        return stepBy(kPageShare * range);
    case Qt::Key_Home:
        return moveTo(mMinimum);
    case Qt::Key_End:
        return moveTo(mMaximum);
    default:
        QWidget::keyPressEvent(event);
    }
}

void CThinHorizontalSlider::stepBy(double delta) {
    moveTo(mStepper(mValue, delta));
}

void CThinHorizontalSlider::changeEvent(QEvent* event) {
    if (event->type() == QEvent::EnabledChange && !isEnabled()) {
        mDragging = false; // a release will not come any more
        setMouseTracking(false);
    }
    QWidget::changeEvent(event);
}

void CThinHorizontalSlider::ensureStops() {
    if (mStops.size() >= 2)
        return;
    Log::log(LogLevel::Warning,
             "This slider is using loadDefaultColors, this is probably a programming error.");
    mStops = {{0, QColor(0, 0, 0)}, {1000, QColor(244, 244, 244)}};
}

double CThinHorizontalSlider::share() const {
    const double range = mMaximum - mMinimum;
    return range == 0 ? 0 : std::clamp(mValue / range, 0.0, 1.0);
}

void CThinHorizontalSlider::paintEvent(QPaintEvent*) {
    ensureStops();
    QPainter painter(this);
    paintTrack(painter);
    paintHandle(painter);
}

void CThinHorizontalSlider::paintTrack(QPainter& painter) const {
    const QRectF track(0, 1, width(), height() - 2);
    QLinearGradient shade(0, 0, 0, height());
    shade.setColorAt(0, Qt::white);
    shade.setColorAt(0.5, QColor(210, 210, 210));
    shade.setColorAt(1, Qt::white);
    painter.fillRect(CrispPaint::onGrid(painter, track), shade);
    const QRectF filled(track.left(), track.top(), share() * (width() - 1), track.height());
    painter.fillRect(CrispPaint::onGrid(painter, filled), isEnabled() ? zoneColor(mStops, mValue) : kOffFill);
    CrispPaint::frame(painter, track, hasFocus() ? palette().color(QPalette::Highlight) : kOutline);
}

void CThinHorizontalSlider::paintHandle(QPainter& painter) const {
    const double left = std::clamp(share() * (width() - 1) + 1 - kHandleWidth / 2.0, 0.0,
                                   std::max(0.0, double(width() - kHandleWidth)));
    const QRectF handle = CrispPaint::onGrid(painter, QRectF(left, 0, kHandleWidth, height()));
    if (!isEnabled()) { // a struck-through track with a mere notch: off shows without colour too
        const double middle = height() / 2.0;
        for (double x = 3; x < width() - 5; x += 6)
            painter.fillRect(CrispPaint::onGrid(painter, QRectF(x, middle - 0.5, 3, 1)), kOutline);
        painter.fillRect(CrispPaint::onGrid(painter, QRectF(handle.center().x() - 0.5, 0, 1, height())),
                         kOutline);
        return;
    }
    painter.fillRect(handle, hasFocus() ? palette().color(QPalette::Highlight) : QColor(250, 250, 250));
    CrispPaint::frame(painter, handle, QColor(60, 60, 60));
}
