#pragma once

#include <QSize>

class CARGBPlane;
class QGraphicsScene;

namespace orvela {

/// Fills preview scenes.
namespace PreviewScene {

/// Shows `plane` in `scene` as one cell in place of all the cells that the scene held. With the environment
/// variable "ORVELA_SHOW_GRID" set, the cell has a green outline. The plane is read when the scene is
/// painted.
void show(QGraphicsScene& scene, const CARGBPlane& plane);

/// The same with cells of `tile` pixels, those at the right and lower edges clipped to the plane.
void show(QGraphicsScene& scene, const CARGBPlane& plane, QSize tile);

} // namespace PreviewScene

} // namespace orvela
