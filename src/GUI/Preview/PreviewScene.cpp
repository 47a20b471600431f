#include "GUI/Preview/PreviewScene.h"

#include "GUI/Preview/CGridCell.h"

#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QPen>

namespace orvela {

namespace PreviewScene {

namespace {

void addOutline(QGraphicsScene& scene, const QRect& tile) {
    QGraphicsRectItem* outline =
        scene.addRect(QRectF(QPointF(0, 0), QSizeF(tile.size())), QPen(QColor(0, 255, 0), 0));
    outline->setPos(tile.topLeft());
    outline->setZValue(2);
}

void addTile(QGraphicsScene& scene, const CARGBPlane& plane, const QRect& tile) {
    auto* cell = new CGridCell(plane, tile.left(), tile.top(), tile.right(), tile.bottom());
    cell->setPos(tile.topLeft());
    cell->setZValue(1);
    scene.addItem(cell);
    if (qEnvironmentVariableIsSet("ORVELA_SHOW_GRID"))
        addOutline(scene, tile);
}

} // namespace

void show(QGraphicsScene& scene, const CARGBPlane& plane) {
    show(scene, plane, QSize(plane.width(), plane.height()));
}

void show(QGraphicsScene& scene, const CARGBPlane& plane, QSize tile) {
    for (QGraphicsItem* item : scene.items())
        if (dynamic_cast<CGridCell*>(item) || dynamic_cast<QGraphicsRectItem*>(item))
            delete item;
    const QRect whole(0, 0, plane.width(), plane.height());
    scene.setSceneRect(whole);
    if (whole.isEmpty() || tile.isEmpty())
        return;
    for (int top = 0; top < whole.height(); top += tile.height())
        for (int left = 0; left < whole.width(); left += tile.width())
            addTile(scene, plane, QRect(QPoint(left, top), tile) & whole);
}

} // namespace PreviewScene

} // namespace orvela
