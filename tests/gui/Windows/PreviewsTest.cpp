// The previews of the real processing window: their places, zoom, scrolling, drafts.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Windows/CDlgSinglePreviewImpl.h"
#include "gui/Windows/ProcessingWindow.h"

#include <QLabel>
#include <QPainter>
#include <QScrollBar>
#include <QWheelEvent>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

constexpr QSize kSize(240, 360);

std::unique_ptr<CARGBPlane> picture() {
    return testplanes::make(kSize.width(), kSize.height(), [](int x, int y) {
        return testplanes::Pixel{std::uint8_t(40 + x / 2), std::uint8_t(30 + (x + y) / 4),
                                 std::uint8_t(20 + y / 2)};
    });
}

class PreviewsTest : public testing::Test {
protected:
    static void turnWheel(CSignaledGraphicsView* view, int notches, QPointF at) {
        QWheelEvent event(at, view->viewport()->mapToGlobal(at), {}, {0, 120 * notches}, {}, {},
                          Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(view->viewport(), &event);
    }

    bool showsDraft() {
        const auto labels = opened.window.findChildren<QLabel*>();
        return std::ranges::any_of(
            labels, [](const QLabel* label) { return label->text() == "Draft" && label->isVisible(); });
    }

    // What the processed picture is painted as, at its own size.
    QImage shown() {
        QImage image(kSize, QImage::Format_RGB32);
        QPainter painter(&image);
        opened.views()[1]->scene()->render(&painter);
        return image;
    }

    QImage result() {
        QImage image(kSize, QImage::Format_RGB32);
        for (int y = 0; y < image.height(); ++y)
            for (int x = 0; x < image.width(); ++x) {
                const auto [r, g, b] = testplanes::at(opened.output, x, y);
                image.setPixel(x, y, qRgb(r, g, b));
            }
        return image;
    }

    // Presses the slider and moves the mouse along it without letting go.
    QWidget* beginDrag(const char* name) {
        opened.block(name)->setEnabled(true);
        QWidget* slider = opened.block(name)->sldrValue;
        QTest::mousePress(slider, Qt::LeftButton, {}, QPoint(2, 3));
        moveHeldMouse(slider, QPointF(slider->width() - 3, 3));
        return slider;
    }

    ProcessingWindow opened{Mode_Advanced, picture()};
};

TEST_F(PreviewsTest, AreFoundAgainSplitAndWhereTheyWere) {
    const QRect place(60, 70, 300, 240);
    opened.run([&] {
        opened.click("btnSplitPreviews");
        opened.window.findChild<CDlgSinglePreviewImpl*>()->setGeometry(place);
        opened.click("btnCancel");
    });
    ProcessingWindow again(Mode_Advanced, picture());
    again.run([&] {
        EXPECT_TRUE(again.window.findChild<CDlgSinglePreviewImpl*>()->isVisible());
        EXPECT_EQ(again.window.findChild<CDlgSinglePreviewImpl*>()->geometry(), place);
        again.click("btnCancel");
    });
}

TEST_F(PreviewsTest, FitTheWidthReachTheWholePictureAndZoomByTheirTable) {
    opened.run([&] {
        CSignaledGraphicsView* view = opened.views()[1];
        const auto expectScale = [&](const char* told, double factor) {
            EXPECT_EQ(opened.find<QLabel>("lblZoomLevel")->text(), told);
            for (const CSignaledGraphicsView* each : opened.views())
                EXPECT_NEAR(each->transform().m11(), factor * view->width() / kSize.width(), 0.01 * factor);
        };
        for (const QSize window : {QSize(800, 700), QSize(800, 500), QSize(900, 500)}) {
            opened.find("CDlgDualPreview")->resize(window);
            QTest::qWait(50);
            expectScale("100%", 1);
            view->verticalScrollBar()->setValue(view->verticalScrollBar()->maximum());
            EXPECT_NEAR(view->mapToScene(QPoint(0, view->viewport()->height())).y(), kSize.height(), 1);
        }
        opened.click("btnZoomOut");
        expectScale("66.7%", 0.667);
        for (const char* told : {"100%", "150%"}) {
            opened.click("btnZoomIn");
            expectScale(told, QByteArray(told).chopped(1).toDouble() / 100);
        }
        for (int i = 0; i < 20; ++i)
            opened.click("btnZoomIn");
        expectScale("5000%", 50);
        for (int i = 0; i < 40; ++i)
            opened.click("btnZoomOut");
        EXPECT_EQ(opened.find<QLabel>("lblZoomLevel")->text(), "1%");
        opened.find("CDlgDualPreview")->resize(800, 500);
        QTest::qWait(50);
        expectScale("1%", 1); // fitted anew
        opened.click("btnCancel");
    });
}

TEST_F(PreviewsTest, TheWheelZoomsAroundThePointOfThePicturesUnderIt) {
    opened.run([&] {
        const auto views = opened.views();
        for (CSignaledGraphicsView* view : views) {
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
                EXPECT_EQ(views[0]->viewportTransform(), views[1]->viewportTransform());
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
            CSignaledGraphicsView* view = opened.views()[dragged];
            CSignaledGraphicsView* other = opened.views()[1 - dragged];
            const int before = view->horizontalScrollBar()->value();
            QTest::mousePress(view->viewport(), Qt::LeftButton, {}, QPoint(80, 80));
            moveHeldMouse(view->viewport(), QPointF(50, 60));
            QTest::mouseRelease(view->viewport(), Qt::LeftButton, {}, QPoint(50, 60));
            EXPECT_EQ(other->horizontalScrollBar()->value(), before + 30);
            QTest::keyClick(view, Qt::Key_Down);
            EXPECT_EQ(other->viewportTransform(), view->viewportTransform());
        }
        opened.click("btnCancel");
    });
}

TEST_F(PreviewsTest, ADragShowsADraftThatTheRefreshReplaces) {
    opened.run([&] {
        opened.click("btnRefresh");
        EXPECT_FALSE(showsDraft());
        EXPECT_EQ(shown(), result());
        opened.click("chkBxAutoRefresh");
        QWidget* slider = beginDrag("sldrDigitalFlash");
        EXPECT_TRUE(QTest::qWaitFor([&] { return showsDraft(); }));
        EXPECT_NE(shown(), result()) << "another look, and no run has begun";
        QTest::mouseRelease(slider, Qt::LeftButton, {}, QPoint(slider->width() - 3, 3));
        EXPECT_TRUE(QTest::qWaitFor([&] { return !showsDraft(); }));
        EXPECT_EQ(shown(), result());
        opened.click("btnCancel");
    });
}

// A draft that is still being made when a run, another mode or the end comes is not shown any more.
TEST_F(PreviewsTest, AStaleDraftIsNotPainted) {
    opened.run([&] {
        const auto expectNoDraft = [&] {
            const QImage now = shown();
            QTest::qWait(300);
            EXPECT_FALSE(showsDraft());
            EXPECT_EQ(shown(), now);
        };
        opened.click("btnRefresh");
        beginDrag("sldrDigitalFlash");
        opened.click("btnRefresh");
        EXPECT_EQ(shown(), result());
        expectNoDraft();
        beginDrag("sldrSaturation");
        opened.window.changeMode(Mode_FinalTouch);
        expectNoDraft();
        opened.click("btnCancel");
    });
}

} // namespace
