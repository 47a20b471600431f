#include "GUI/Controls/CGridCell.h"
#include "GUI/Controls/CSignaledGraphicsView.h"
#include "GUI/Controls/PreviewScene.h"
#include "support/TestPlanes.h"

#include <QGraphicsScene>
#include <QPainter>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

/// A plane whose samples tell their place.
std::unique_ptr<CARGBPlane> places(int width, int height) {
    return testplanes::make(width, height, [](int x, int y) {
        return testplanes::Pixel{std::uint8_t(10 * x), std::uint8_t(10 * y), std::uint8_t(x + y)};
    });
}

QImage rendered(QGraphicsScene& scene) {
    QImage image(scene.sceneRect().size().toSize(), QImage::Format_RGB32);
    image.fill(Qt::magenta);
    QPainter painter(&image);
    scene.render(&painter);
    return image;
}

QString cellsOf(const QGraphicsScene& scene) {
    QStringList cells;
    for (const QGraphicsItem* item : scene.items(Qt::AscendingOrder)) {
        const QRectF at = item->sceneBoundingRect();
        cells += QString::asprintf("%g:%g,%g,%gx%g", item->zValue(), at.x(), at.y(), at.width(), at.height());
    }
    return cells.join(QLatin1Char(' '));
}

TEST(PreviewScene, TilesThePlaneAndShowsEveryPixel) {
    const auto plane = places(7, 5);
    QGraphicsScene scene;
    scene.addRect(0, 0, 900, 900);
    PreviewScene::show(scene, *plane, {4, 3});
    EXPECT_EQ(scene.sceneRect(), QRectF(0, 0, 7, 5));
    EXPECT_EQ(cellsOf(scene).toStdString(), "1:0,0,4x3 1:4,0,3x3 1:0,3,4x2 1:4,3,3x2");
    const QImage image = rendered(scene);
    for (int y = 0; y < 5; ++y)
        for (int x = 0; x < 7; ++x)
            ASSERT_EQ(image.pixel(x, y), qRgb(10 * x, 10 * y, x + y)) << x << "," << y;
}

TEST(PreviewScene, OneCellReadsThePlaneWhenFirstPainted) {
    const auto plane = places(3, 2);
    plane->setColorMode(CARGBPlane::Grayscale);
    QGraphicsScene scene;
    PreviewScene::show(scene, *plane);
    EXPECT_EQ(cellsOf(scene).toStdString(), "1:0,0,3x2");
    plane->row(1)[0][2] = 77;
    EXPECT_EQ(rendered(scene).pixel(2, 1), qRgb(77, 77, 77));
    plane->row(1)[0][2] = 1;
    EXPECT_EQ(rendered(scene).pixel(2, 1), qRgb(77, 77, 77)) << "kept until shown anew";
    const CARGBPlane empty(0, 0, QStringLiteral("empty"));
    PreviewScene::show(scene, empty);
    EXPECT_TRUE(scene.items().isEmpty());
}

TEST(CSignaledGraphicsView, TellsWhereItWasDraggedToAndItsSize) {
    QGraphicsScene scene(0, 0, 1000, 800);
    CSignaledGraphicsView view(&scene);
    view.setDragMode(QGraphicsView::ScrollHandDrag);
    QSignalSpy resized(&view, &CSignaledGraphicsView::sizeChanged);
    view.setGeometry(30, 40, 200, 150);
    view.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&view));
    ASSERT_FALSE(resized.isEmpty());
    EXPECT_EQ(resized.last()[0].toRect(), view.geometry());
    view.setTransform(QTransform::fromScale(2, 2)); // gives the scroll bars their ranges
    view.horizontalScrollBar()->setValue(300);
    view.verticalScrollBar()->setValue(400);
    QSignalSpy scrolled(&view, &CSignaledGraphicsView::scrolledBy);
    QTest::mousePress(view.viewport(), Qt::LeftButton, {}, QPoint(100, 100));
    QMouseEvent move(QEvent::MouseMove, {90, 75}, {}, Qt::NoButton, Qt::LeftButton, {});
    QCoreApplication::sendEvent(view.viewport(), &move);
    ASSERT_EQ(scrolled.count(), 1);
    EXPECT_EQ(scrolled[0], (QList<QVariant>{310, 425}));
}

} // namespace
