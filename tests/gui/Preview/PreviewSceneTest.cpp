#include "GUI/Preview/PreviewScene.h"

#include "GUI/Preview/CGridCell.h"
#include "support/EnvironmentVariable.h"
#include "support/LogCapture.h"
#include "support/TestPlanes.h"

#include <QGraphicsItem>
#include <QGraphicsScene>
#include <QPainter>

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

TEST(PreviewScene, OutlinesItsTilesWhereTheEnvironmentSaysSo) {
    const EnvironmentVariable grid("ORVELA_SHOW_GRID", "");
    const auto plane = places(7, 5);
    QGraphicsScene scene;
    for (int shown = 0; shown < 2; ++shown) // the outlines go with their cells
        PreviewScene::show(scene, *plane, {4, 3});
    EXPECT_EQ(scene.items().size(), 8);
    EXPECT_EQ(rendered(scene).pixel(4, 1), qRgb(0, 255, 0));
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

TEST(CGridCell, LeavesATileOutThatFindsNoMemoryAndLogsItOnce) {
    const auto plane = places(4, 1);
    CGridCell cell(*plane, 0, 0, 70'000'000, 0); // no image can be so wide
    QImage ground(4, 4, QImage::Format_RGB32);
    ground.fill(Qt::magenta);
    const QImage before = ground.copy();
    const LogCapture log;
    QPainter painter(&ground);
    for (int i = 0; i < 2; ++i)
        cell.paint(&painter, nullptr, nullptr);
    painter.end();
    EXPECT_EQ(ground, before);
    EXPECT_EQ(log.lines().size(), 1U);
}

} // namespace
