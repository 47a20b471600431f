#pragma once

#include "Utility/CARGBPlane.h"

#include <QGraphicsPixmapItem>

/// A tile of a plane in a preview scene. Its pixels are read when it is first painted.
class CGridCell : public QGraphicsPixmapItem {
public:
    /// Shows columns left to right and rows top to bottom, all inclusive and within the plane. The plane is
    /// not owned and must live as long as the cell may be painted.
    CGridCell(const CARGBPlane& plane, int left, int top, int right, int bottom);

    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;

private:
    void rebuild();

    const CARGBPlane& mPlane;
    int mLeft;
    int mTop;
    int mRight;
    int mBottom;
    bool mNeedsRebuild = true;
};
