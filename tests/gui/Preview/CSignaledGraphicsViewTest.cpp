#include "GUI/Preview/CSignaledGraphicsView.h"

#include <QGraphicsScene>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>

#include <gtest/gtest.h>

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
