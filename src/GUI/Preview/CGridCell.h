#pragma once

#include "Utility/CARGBPlane.h"

#include <QGraphicsPixmapItem>
#include <QHash>

/// A tile of a plane in a preview scene. Its pixels are read when it is first painted. Seen from further away
/// it is painted from a copy of half, a quarter, ... of the size, each made when first needed: reduced means
/// show no patterns that the picture does not have, and scrolling never goes over more pixels than the screen
/// shows.
class CGridCell : public QGraphicsPixmapItem {
public:
    /// Shows columns left to right and rows top to bottom, all inclusive and within the plane. The plane is
    /// not owned and must live as long as the cell may be painted.
    CGridCell(const CARGBPlane& plane, int left, int top, int right, int bottom);

    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;

private:
    QRect part() const { return {QPoint(mLeft, mTop), QPoint(mRight, mBottom)}; }
    void paintTile(QPainter& painter);
    const QPixmap& pixmapFor(int level);

    const CARGBPlane& mPlane;
    int mLeft;
    int mTop;
    int mRight;
    int mBottom;
    bool mFailed = false;         ///< to find memory; that was logged
    QHash<int, QPixmap> mPixmaps; ///< by how often the size was halved
};
