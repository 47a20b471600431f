// The previews of the real processing window: zoom, scrolling, drafts.

#include "GUI/Windows/Previews.h"

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "gui/Windows/ProcessingWindow.h"

#include <QCheckBox>
#include <QLabel>
#include <QPainter>
#include <QScrollBar>
#include <QWheelEvent>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

std::unique_ptr<CARGBPlane> picture() {
    return testplanes::make(320, 240, [](int x, int y) {
        return testplanes::Pixel{std::uint8_t(40 + x / 2), std::uint8_t(30 + (x + y) / 4),
                                 std::uint8_t(20 + y / 2)};
    });
}

class PreviewsTest : public testing::Test {
protected:
    QList<CSignaledGraphicsView*> views() { return opened.window.findChildren<CSignaledGraphicsView*>(); }

    static void turnWheel(CSignaledGraphicsView* view, int notches, QPointF at) {
        QWheelEvent event(at, view->viewport()->mapToGlobal(at), {}, {0, 120 * notches}, {}, {},
                          Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(view->viewport(), &event);
    }

    QLabel* draftLabel() {
        for (QLabel* label : opened.window.findChildren<QLabel*>())
            if (label->text() == "Draft")
                return label;
        return nullptr;
    }

    // What the processed picture is painted as, at its own size.
    QImage shown() {
        QImage image(320, 240, QImage::Format_RGB32);
        QPainter painter(&image);
        views()[1]->scene()->render(&painter);
        return image;
    }

    static QImage imageOf(const CARGBPlane& plane) {
        QImage image(plane.width(), plane.height(), QImage::Format_RGB32);
        for (int y = 0; y < plane.height(); ++y)
            for (int x = 0; x < plane.width(); ++x) {
                const auto [r, g, b] = testplanes::at(plane, x, y);
                image.setPixel(x, y, qRgb(r, g, b));
            }
        return image;
    }

    // Presses the slider and moves the mouse along it without letting go.
    QWidget* beginDrag(const char* name) {
        auto* block = opened.find<COrvelaSliderBlockImpl>(name);
        block->setEnabled(true);
        QWidget* slider = block->sldrValue;
        QTest::mousePress(slider, Qt::LeftButton, {}, QPoint(2, 3));
        QMouseEvent move(QEvent::MouseMove, QPointF(slider->width() - 3, 3),
                         slider->mapToGlobal(QPointF(slider->width() - 3, 3)), Qt::NoButton, Qt::LeftButton,
                         {});
        QCoreApplication::sendEvent(slider, &move);
        return slider;
    }

    ProcessingWindow opened{Mode_Advanced, picture()};
};

TEST_F(PreviewsTest, TheWheelZoomsAroundThePointOfThePicturesUnderIt) {
    opened.run([&] {
        for (CSignaledGraphicsView* view : views()) {
            for (int i = 0; i < 5; ++i)
                opened.click("btnZoomIn"); // so that there is something to scroll
            const QPointF at(view->viewport()->width() * 0.3, view->viewport()->height() * 0.6);
            for (const int notches : {1, 2, -1, 1, -2}) {
                const QPointF before = view->mapToScene(at.toPoint());
                const double scale = view->transform().m11();
                turnWheel(view, notches, at);
                EXPECT_NE(view->transform().m11(), scale);
                const QPointF moved = view->mapToScene(at.toPoint()) - before;
                EXPECT_LT(moved.manhattanLength() * view->transform().m11(), 3) << "pixels of the screen";
                EXPECT_EQ(views()[0]->transform(), views()[1]->transform());
                EXPECT_EQ(views()[0]->horizontalScrollBar()->value(),
                          views()[1]->horizontalScrollBar()->value());
                EXPECT_EQ(views()[0]->verticalScrollBar()->value(), views()[1]->verticalScrollBar()->value());
            }
            QTest::keyClick(view, Qt::Key_0, Qt::ControlModifier);
        }
        opened.click("btnCancel");
    });
}

TEST_F(PreviewsTest, DraggingAPictureOrItsArrowKeysMoveTheOtherOne) {
    opened.run([&] {
        for (int i = 0; i < 6; ++i)
            opened.click("btnZoomIn");
        for (const int dragged : {0, 1}) {
            CSignaledGraphicsView* view = views()[dragged];
            CSignaledGraphicsView* other = views()[1 - dragged];
            const int before = view->horizontalScrollBar()->value();
            QTest::mousePress(view->viewport(), Qt::LeftButton, {}, QPoint(80, 80));
            QMouseEvent move(QEvent::MouseMove, {50, 60}, view->viewport()->mapToGlobal(QPointF(50, 60)),
                             Qt::NoButton, Qt::LeftButton, {});
            QCoreApplication::sendEvent(view->viewport(), &move);
            QTest::mouseRelease(view->viewport(), Qt::LeftButton, {}, QPoint(50, 60));
            EXPECT_EQ(view->horizontalScrollBar()->value(), before + 30);
            EXPECT_EQ(other->horizontalScrollBar()->value(), before + 30);
            QTest::keyClick(view, Qt::Key_Down);
            EXPECT_EQ(other->verticalScrollBar()->value(), view->verticalScrollBar()->value());
            EXPECT_EQ(other->mapToScene(0, 0), view->mapToScene(0, 0));
        }
        opened.click("btnCancel");
    });
}

TEST_F(PreviewsTest, ADragShowsADraftThatTheRefreshReplaces) {
    opened.run([&] {
        opened.click("btnRefresh");
        EXPECT_FALSE(draftLabel()->isVisible());
        EXPECT_EQ(shown(), imageOf(opened.output));
        opened.click("chkBxAutoRefresh");
        QWidget* slider = beginDrag("sldrDigitalFlash");
        EXPECT_TRUE(QTest::qWaitFor([&] { return draftLabel()->isVisible(); }));
        EXPECT_NE(shown(), imageOf(opened.output)) << "another look, and no run has begun";
        QTest::mouseRelease(slider, Qt::LeftButton, {}, QPoint(slider->width() - 3, 3));
        EXPECT_TRUE(QTest::qWaitFor([&] { return !draftLabel()->isVisible(); }));
        EXPECT_EQ(shown(), imageOf(opened.output));
        opened.click("btnCancel");
    });
}

// A draft that is still being made when a run, another mode or the end comes is not shown any more.
TEST_F(PreviewsTest, AStaleDraftIsNotPainted) {
    opened.run([&] {
        opened.click("btnRefresh");
        beginDrag("sldrDigitalFlash");
        opened.click("btnRefresh");
        const QImage after = shown();
        EXPECT_EQ(after, imageOf(opened.output));
        QTest::qWait(300);
        EXPECT_FALSE(draftLabel()->isVisible());
        EXPECT_EQ(shown(), after);
        beginDrag("sldrSaturation");
        opened.window.changeMode(Mode_FinalTouch);
        const QImage touch = shown();
        QTest::qWait(300);
        EXPECT_FALSE(draftLabel()->isVisible());
        EXPECT_EQ(shown(), touch);
        opened.click("btnCancel");
    });
}

} // namespace
