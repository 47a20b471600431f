#pragma once

#include "GUI/Preview/CGridCell.h"

#include <QGraphicsItem>

#include <memory>

namespace orvela {

/// The picture before over the picture after, up to an upright line that the mouse drags, or all of it.
class CompareCurtain final : public QGraphicsItem {
public:
    /// @param share  of the width that shows the picture before, 0 to 1
    CompareCurtain(std::shared_ptr<const CARGBPlane> before, double share);

    double share() const { return mShare; }
    /// Moves the line; shares beyond 0 and 1 mean the edges.
    void setShare(double share);
    /// Shows the whole picture before, without a line, as long as it is held.
    void setHeld(bool held);

    QRectF boundingRect() const override;
    QPainterPath shape() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;

protected:
    void mousePressEvent(QGraphicsSceneMouseEvent* event) override;
    void mouseMoveEvent(QGraphicsSceneMouseEvent* event) override;

private:
    double lineX() const { return mShare * boundingRect().width(); }
    void paintLine(QPainter* painter) const;

    std::shared_ptr<const CARGBPlane> mBefore;
    CGridCell mCell;
    double mShare;
    double mPixel = 1; ///< of the screen, in pixels of the picture
    bool mHeld = false;
};

} // namespace orvela
