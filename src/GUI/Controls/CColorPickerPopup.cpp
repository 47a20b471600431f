#include "GUI/Controls/CColorPickerPopup.h"

#include "GUI/Controls/Artwork.h"
#include "GUI/Controls/ControlAccessibility.h"
#include "GUI/Controls/CrispPaint.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScreen>

#include <algorithm>
#include <limits>

using namespace orvela;

namespace {

constexpr int kKeyStep = 4; // pixels
constexpr double kRingRadius = 5;

QString fieldPath() {
    return QStringLiteral(":/Advanced UI/Misc_ColorPicker.png");
}

int distance(QRgb one, QRgb other) {
    const int red = qRed(one) - qRed(other);
    const int green = qGreen(one) - qGreen(other);
    const int blue = qBlue(one) - qBlue(other);
    return red * red + green * green + blue * blue;
}

QPoint into(const QRect& rect, const QPoint& point) {
    return {std::clamp(point.x(), rect.left(), std::max(rect.left(), rect.right())),
            std::clamp(point.y(), rect.top(), std::max(rect.top(), rect.bottom()))};
}

} // namespace

CColorPickerPopup::CColorPickerPopup(QWidget* parent) : QWidget(parent, Qt::Popup) {
    installControlAccessibility();
    initArtwork();
    mField = QImage(fieldPath()).convertToFormat(QImage::Format_RGB32);
    mPicture = QPixmap(fieldPath());
    setFixedSize(mField.size());
    setCursor(Qt::CrossCursor);
    setAttribute(Qt::WA_NoMouseReplay); // a press on the picker closes the field and does not open it again
    setAccessibleName(tr("Color field"));
}

void CColorPickerPopup::open(const QPoint& corner, const QColor& color, const QPoint& pressed) {
    mChosen = closestTo(color);
    mBefore = mColor = color;
    mPressed = pressed;
    mReleaseCloses = false;
    const QRect available = (parentWidget() ? parentWidget() : this)->screen()->availableGeometry();
    move(into(available.adjusted(0, 0, -width(), -height()), corner));
    setMouseTracking(true);
    show();
}

QPoint CColorPickerPopup::closestTo(const QColor& color) const {
    QPoint closest;
    int least = std::numeric_limits<int>::max();
    for (int y = 0; y < mField.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(mField.constScanLine(y));
        const auto* found = std::min_element(line, line + mField.width(), [&color](QRgb one, QRgb other) {
            return distance(one, color.rgb()) < distance(other, color.rgb());
        });
        if (distance(*found, color.rgb()) < least) {
            least = distance(*found, color.rgb());
            closest = QPoint(static_cast<int>(found - line), y);
        }
    }
    return closest;
}

void CColorPickerPopup::choose(const QPoint& point) {
    mChosen = point;
    mColor = mField.pixelColor(point);
    update();
    Q_EMIT colorChanged(mColor);
}

void CColorPickerPopup::takeBack() {
    if (mColor != mBefore)
        Q_EMIT colorChanged(mBefore);
    hide();
}

void CColorPickerPopup::mousePressEvent(QMouseEvent* event) {
    mReleaseCloses = true;
    QWidget::mousePressEvent(event);
}

void CColorPickerPopup::mouseMoveEvent(QMouseEvent* event) {
    const QPoint moved = event->globalPosition().toPoint() - mPressed;
    mReleaseCloses = mReleaseCloses || moved.manhattanLength() >= QApplication::startDragDistance();
    const QPoint point = event->position().toPoint();
    if (mField.valid(point))
        choose(point);
}

void CColorPickerPopup::mouseReleaseEvent(QMouseEvent* event) {
    if (mReleaseCloses && rect().contains(event->position().toPoint()))
        hide();
}

void CColorPickerPopup::keyPressEvent(QKeyEvent* event) {
    const int step = event->modifiers().testFlag(Qt::ControlModifier) ? 1 : kKeyStep;
    const auto moveBy = [this](int x, int y) { choose(into(mField.rect(), mChosen + QPoint(x, y))); };
    switch (event->key()) {
    case Qt::Key_Left:
        return moveBy(-step, 0);
    case Qt::Key_Right:
        return moveBy(step, 0);
    case Qt::Key_Up:
        return moveBy(0, -step);
    case Qt::Key_Down:
        return moveBy(0, step);
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Space:
        return hide();
    case Qt::Key_Escape:
        return takeBack();
    default:
        QWidget::keyPressEvent(event);
    }
}

void CColorPickerPopup::hideEvent(QHideEvent* event) {
    setMouseTracking(false);
    QWidget::hideEvent(event);
}

void CColorPickerPopup::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.drawPixmap(rect(), mPicture);
    CrispPaint::frame(painter, rect(), QColor(110, 110, 110));
    painter.setRenderHint(QPainter::Antialiasing);
    const QPointF center = QPointF(mChosen) + QPointF(0.5, 0.5);
    painter.setPen(QPen(Qt::black, 3));
    painter.drawEllipse(center, kRingRadius, kRingRadius);
    painter.setPen(QPen(Qt::white, 1.5));
    painter.drawEllipse(center, kRingRadius, kRingRadius);
}
