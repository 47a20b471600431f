#include "GUI/Preview/CompareCurtain.h"

#include <QCursor>
#include <QGraphicsSceneMouseEvent>
#include <QPainter>
#include <QStyleOptionGraphicsItem>

#include <algorithm>

namespace orvela {

namespace {

constexpr double kGrip = 6; // pixels of the screen beside the line that take the mouse
constexpr double kHandle = 7;
constexpr double kAbove = 3; // what the pictures lie at is 1, the outline of a tile 2

} // namespace

CompareCurtain::CompareCurtain(std::shared_ptr<const CARGBPlane> before, double share)
    : mBefore(std::move(before)), mCell(*mBefore, 0, 0, mBefore->width() - 1, mBefore->height() - 1),
      mShare(share) {
    setZValue(kAbove);
    setCursor(Qt::SplitHCursor);
}

void CompareCurtain::setShare(double share) {
    mShare = std::clamp(share, 0.0, 1.0);
    prepareGeometryChange();
    update();
}

void CompareCurtain::setHeld(bool held) {
    mHeld = held;
    prepareGeometryChange();
}

QRectF CompareCurtain::boundingRect() const {
    return mCell.boundingRect();
}

// Only the line takes the mouse; everywhere else it drags the picture.
QPainterPath CompareCurtain::shape() const {
    QPainterPath path;
    if (!mHeld)
        path.addRect(lineX() - kGrip * mPixel, 0, 2 * kGrip * mPixel, boundingRect().height());
    return path;
}

void CompareCurtain::paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) {
    const QRectF whole = boundingRect();
    painter->save();
    if (!mHeld)
        painter->setClipRect(QRectF(0, 0, lineX(), whole.height()), Qt::IntersectClip);
    mCell.paint(painter, option, widget);
    painter->restore();
    const double scale = QStyleOptionGraphicsItem::levelOfDetailFromTransform(painter->worldTransform());
    mPixel = scale > 0 ? 1 / scale : 1;
    if (!mHeld)
        paintLine(painter);
}

void CompareCurtain::paintLine(QPainter* painter) const {
    const double x = lineX();
    const double height = boundingRect().height();
    for (const auto& [color, width] : {std::pair(Qt::black, 3.0), std::pair(Qt::white, 1.0)}) {
        QPen line(color, width);
        line.setCosmetic(true);
        painter->setPen(line);
        painter->drawLine(QPointF(x, 0), QPointF(x, height));
    }
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setBrush(Qt::white);
    QPen rim(Qt::black, 1);
    rim.setCosmetic(true);
    painter->setPen(rim);
    painter->drawEllipse(QPointF(x, height / 2), kHandle * mPixel, kHandle * mPixel);
}

void CompareCurtain::mousePressEvent(QGraphicsSceneMouseEvent* event) {
    event->setAccepted(event->button() == Qt::LeftButton);
}

void CompareCurtain::mouseMoveEvent(QGraphicsSceneMouseEvent* event) {
    setShare(event->pos().x() / boundingRect().width());
}

} // namespace orvela
