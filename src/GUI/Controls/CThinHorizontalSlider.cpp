#include "GUI/Controls/CThinHorizontalSlider.h"

#include "GUI/Controls/ControlAccessibility.h"
#include "GUI/Controls/CrispPaint.h"
#include "Utility/Logger.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

constexpr int kHeight = 7;
constexpr int kHandleWidth = 5;
constexpr double kStepShare = 0.01; // of the range
constexpr double kPageSteps = 10;
constexpr double kFineSteps = 0.1;
constexpr double kQuiet = 0.35;     // opacity of a track that is off
constexpr double kDarkQuiet = 0.15; // the same on a dark ground
constexpr double kDarkEmpty = 0.35; // opacity of the part behind the handle on a dark ground
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
}

void CThinHorizontalSlider::moveTo(double value) {
    setValue(std::clamp(value, mMinimum, mMaximum));
    Q_EMIT valueChanged(mValue);
}

void CThinHorizontalSlider::mousePressEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton)
        return event->ignore();
    mDragging = true;
    setMouseTracking(true);
    handlePoint(event->position());
}

void CThinHorizontalSlider::mouseMoveEvent(QMouseEvent* event) {
    if (mDragging)
        handlePoint(event->position());
}

void CThinHorizontalSlider::mouseReleaseEvent(QMouseEvent* event) {
    if (!mDragging || event->button() != Qt::LeftButton)
        return;
    endDrag();
    handlePoint(event->position());
}

void CThinHorizontalSlider::endDrag() {
    mDragging = false;
    setMouseTracking(false);
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

void CThinHorizontalSlider::keyPressEvent(QKeyEvent* event) {
    const double step = event->modifiers().testFlag(Qt::ControlModifier) ? kFineSteps : 1;
    switch (event->key()) {
    case Qt::Key_Left:
    case Qt::Key_Down:
        return stepBy(-step);
    case Qt::Key_Right:
    case Qt::Key_Up:
        return stepBy(step);
    case Qt::Key_PageDown:
        return stepBy(-kPageSteps * step);
    case Qt::Key_PageUp:
        return stepBy(kPageSteps * step);
    case Qt::Key_Home:
        return moveTo(mMinimum);
    case Qt::Key_End:
        return moveTo(mMaximum);
    default:
        QWidget::keyPressEvent(event);
    }
}

void CThinHorizontalSlider::stepBy(double steps) {
    moveTo(mStepper(mValue, steps * kStepShare * (mMaximum - mMinimum)));
}

void CThinHorizontalSlider::changeEvent(QEvent* event) {
    if (event->type() == QEvent::EnabledChange && !isEnabled() && mDragging) {
        endDrag(); // a release will not come any more
        Q_EMIT valueChanged(mValue);
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

bool CThinHorizontalSlider::isOn() const {
    return isEnabledTo(parentWidget());
}

void CThinHorizontalSlider::paintEvent(QPaintEvent*) {
    ensureStops();
    QPainter painter(this);
    paintTrack(painter);
    paintHandle(painter);
}

void CThinHorizontalSlider::paintTrack(QPainter& painter) const {
    const bool dark = CrispPaint::isDark(palette());
    const double opacity = !isOn() ? (dark ? kDarkQuiet : kQuiet) : isEnabled() ? 1 : CrispPaint::kDimmed;
    const QRectF track(0, 1, width(), height() - 2);
    QLinearGradient shade(0, 0, 0, height());
    shade.setColorAt(0, Qt::white);
    shade.setColorAt(0.5, QColor(210, 210, 210));
    shade.setColorAt(1, Qt::white);
    painter.setOpacity(dark && isOn() ? opacity * kDarkEmpty : opacity);
    painter.fillRect(CrispPaint::onGrid(painter, track), shade);
    painter.setOpacity(opacity);
    const QRectF filled(track.left(), track.top(), share() * (width() - 1), track.height());
    painter.fillRect(CrispPaint::onGrid(painter, filled), isOn() ? zoneColor(mStops, mValue) : kOffFill);
    CrispPaint::frame(painter, track, kOutline);
}

void CThinHorizontalSlider::paintHandle(QPainter& painter) const {
    painter.setOpacity(isOn() && isEnabled() ? 1 : CrispPaint::kDimmed);
    const double left = std::clamp(share() * (width() - 1) + 1 - kHandleWidth / 2.0, 0.0,
                                   std::max(0.0, double(width() - kHandleWidth)));
    const QRectF handle = CrispPaint::onGrid(painter, QRectF(left, 0, kHandleWidth, height()));
    painter.fillRect(handle, isOn() ? QColor(250, 250, 250) : palette().color(QPalette::Window));
    CrispPaint::frame(painter, handle, isOn() ? QColor(60, 60, 60) : QColor(140, 140, 140));
}
